// The questions for the line spacing.

#include <cwchar>
#include <iterator>

#include "module/prompt/distance_input.h"
#include "module/prompt/keyword_input.h"
#include "module/styles/line_spacing.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/print.h"
#include "tz/mte/mtext_command.h"

namespace {

bool endsWithX(TzString const& text) {
    wchar_t const last = text.getAt(text.length() - 1);
    return last == L'x' || last == L'X';
}

// The number at the start of a text such as "1.5x", in single precision.
double factorIn(TzString const& text) {
    return static_cast<double>(std::wcstof(text, nullptr));
}

}  // namespace

bool TzxMtextCommandBase::DoLineSpacingStylePrompt() {
    unsigned int ids[] = {kText.atLeast, kText.exactly};
    CKeywordTable keywords(ids, static_cast<int>(std::size(ids)));
    CTzsKeywordInput input(0, keywords, gStringTable[kText.lineSpacingTypePrompt]);
    input.SetDefault(lineSpacingStyle == TzDb::kAtLeast ? kText.atLeast : kText.exactly);
    for (;;) {
        switch (input.Prompt()) {
        case statusCancel: return false;
        case statusNone: return true;
        case statusNormal:
        case statusKeyword:
            lineSpacingStyle =
                input.GetKeyword() == kText.exactly ? TzDb::kExactly : TzDb::kAtLeast;
            return true;
        default: break;
        }
    }
}

bool TzxMtextCommandBase::DoLineSpacingFactorPrompt() {
    CKeywordTable none;
    TzString const prompt = gStringTable[kText.lineSpacingFactorPrompt] +
                            TzString::formatted(L" <%.3gx>", lineSpacingFactor);
    CTzsDistanceInput input(kRefusesNegative | kTakesFreeText, none, prompt, firstCornerUcs);
    for (;;) {
        switch (input.Prompt()) {
        case statusNone: return true;
        case statusCancel: return false;
        case statusNormal:
            if (ValidateLineSpacingFactor(input.GetDistance() / (textHeight * kSingleLineDistance)))
                return true;
            break;
        case statusKeyword: {
            TzString const answer = input.GetInput();
            if (answer.isEmpty()) return true;
            if (endsWithX(answer) && ValidateLineSpacingFactor(factorIn(answer))) return true;
            break;
        }
        default: break;
        }
        tzutPrintf(L"%ls\n", InvalidSpacingFactorMessage(textHeight).kwszPtr());
    }
}

bool TzxMtextCommandBase::DoLineSpacingPrompts() {
    return DoLineSpacingStylePrompt() && DoLineSpacingFactorPrompt();
}
