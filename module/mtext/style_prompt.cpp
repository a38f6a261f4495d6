// The question for the text style.

#include "module/prompt/string_input.h"
#include "module/styles/style_rules.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/print.h"
#include "tz/mte/mtext_command.h"

bool TzxMtextCommandBase::DoStylePrompt() {
    CKeywordTable none;
    CTzsSymbolStringInput input(0, none, gStringTable[kText.stylePrompt]);
    input.SetDefault(styleName);
    for (;;) {
        int const status = input.Prompt();
        if (status == statusCancel) return false;
        if (status == statusNone) {
            styleName = input.GetDefault();
            return true;
        }
        TzString const answer = input.GetInput();
        if (status == statusNormal && answer == gStringTable[kText.listRequest]) {
            EnumerateStyles();
            continue;
        }
        // No name was given, which is also so when the question failed: the style stays.
        if (answer.isEmpty()) return true;
        if (IsStyleNameOK(answer) && answer.find(kExternalStyleMark) == -1) {
            styleName = answer;
            return true;
        }
        tzutPrintf(L"%ls", gStringTable[kText.unusableStyle].kwszPtr());
    }
}
