// The questions for the line spacing.

#include <cwchar>
#include <iterator>

#include "module/prompt/distance_input.h"
#include "module/prompt/keyword_input.h"
#include "module/styles/line_spacing.h"
#include "module/texts/string_table.h"
#include "tz/ed/print.h"
#include "tz/mte/mtext_command.h"

namespace {

// Prompts and keywords.
constexpr unsigned kAtLeast = 1084;
constexpr unsigned kExactly = 1085;
constexpr unsigned kStylePrompt = 1086;
constexpr unsigned kFactorPrompt = 1087;
// Negative values are refused, free text comes through.
constexpr unsigned kFactorFlags = 0x84;

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
    unsigned int ids[] = {kAtLeast, kExactly};
    CKeywordTable keywords(ids, static_cast<int>(std::size(ids)));
    CTzsKeywordInput input(0, keywords, gStringTable[kStylePrompt]);
    input.SetDefault(lineSpacingStyle == TzDb::kAtLeast ? kAtLeast : kExactly);
    for (;;) {
        switch (input.Prompt()) {
        case statusCancel: return false;
        case statusNone: return true;
        case statusNormal:
        case statusKeyword:
            lineSpacingStyle = input.GetKeyword() == kExactly ? TzDb::kExactly : TzDb::kAtLeast;
            return true;
        default: break;
        }
    }
}

bool TzxMtextCommandBase::DoLineSpacingFactorPrompt() {
    CKeywordTable none;
    TzString const prompt =
        gStringTable[kFactorPrompt] + TzString::formatted(L" <%.3gx>", lineSpacingFactor);
    CTzsDistanceInput input(kFactorFlags, none, prompt, firstCornerUcs);
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
