// The question for the text style.

#include "module/prompt/string_input.h"
#include "module/texts/string_table.h"
#include "tz/ed/print.h"
#include "tz/mte/mtext_command.h"

namespace {

constexpr unsigned kPrompt = 1067;
constexpr unsigned kListRequest = 1068;
constexpr unsigned kUnknownStyle = 1069;

// The names of styles that belong to an external reference hold this; they cannot be chosen.
constexpr wchar_t kExternalMark = L'|';

}  // namespace

bool TzxMtextCommandBase::DoStylePrompt() {
    CKeywordTable none;
    CTzsSymbolStringInput input(0, none, gStringTable[kPrompt]);
    input.SetDefault(styleName);
    for (;;) {
        int const status = input.Prompt();
        if (status == statusCancel) return false;
        if (status == statusNone) {
            styleName = input.GetDefault();
            return true;
        }
        TzString const answer = input.GetInput();
        if (status == statusNormal && answer == gStringTable[kListRequest]) {
            EnumerateStyles();
            continue;
        }
        // Nothing was asked for: a failed question leaves the style too.
        if (answer.isEmpty()) return true;
        if (IsStyleNameOK(answer) && answer.find(kExternalMark) == -1) {
            styleName = answer;
            return true;
        }
        tzutPrintf(L"%ls", gStringTable[kUnknownStyle].kwszPtr());
    }
}
