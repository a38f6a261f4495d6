#include <array>

#include "module/shell/registration.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/command_stack.h"
#include "tz/ed/functions.h"
#include "tz/ed/print.h"
#include "tz/mte/edit_mtext.h"
#include "tz/rx/resbuf.h"
#include "tz/rx/status.h"

namespace {

enum FunctionCode : int { kEdit = 0, kProperties = 1, kAlign = 4 };

struct Function {
    TzString* name;
    FunctionCode code;
};

constexpr std::array<Function, 3> kFunctions{{
    {&gsEditMtext_GlobalName, kEdit},
    {&gsAlignText_GlobalName, kAlign},
    {&gsMtprop_GlobalName, kProperties},
}};

}  // namespace

bool defineFunctions() {
    for (Function const& function : kFunctions)
        if (tzedDefun(*function.name, function.code) != Tzad::ePromptNormal) return false;
    // A function without help is a function all the same.
    (void)tzedSetFunHelp(gsEditMtext_GlobalName, nullptr, gsEditMtext_GlobalName, 0);
    (void)tzedSetFunHelp(gsEditMtext_LocalName, nullptr, gsEditMtext_GlobalName, 0);
    (void)tzedSetFunHelp(gsAlignText_GlobalName, nullptr, gsAlignText_GlobalName, 0);
    (void)tzedSetFunHelp(gsAlignText_LocalName, nullptr, gsAlignText_GlobalName, 0);
    return true;
}

// A function that was not defined has nothing to take back.
void undefineFunctions() {
    for (Function const& function : kFunctions)
        (void)tzedUndef(*function.name, function.code);
}

bool invokeFunction() {
    (void)tzedRetVoid();  // outside a call nobody waits for a value
    int const code = tzedGetFunCode();
    // The function for aligning is defined, but has no body.
    if (code != kEdit && code != kProperties) return false;
    resbuf const* const first = tzedGetArgs();
    if (first && first->restype == Tzad::eResultEntityName) {
        MTETabType const tab = code == kEdit ? kMTETabText : kMTETabProperties;
        long long name[] = {first->resval.rlname[0], first->resval.rlname[1]};
        // Any message has been shown by then, and the call counts as successful whatever the result
        // is.
        (void)EditMtextByAdsName(name, tab, true, true);
    } else {
        tzutPrintf(gStringTable[kText.needsEntity]);
    }
    return true;
}
