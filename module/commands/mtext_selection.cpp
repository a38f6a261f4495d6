#include "module/commands/mtext_selection.h"

#include "tz/ed/selection.h"
#include "tz/rx/resbuf.h"
#include "tz/rx/status.h"

int selectMText(long long* set, wchar_t const* mode, KindCode code) {
    wchar_t kind[] = L"MTEXT";
    resbuf filter{nullptr, static_cast<short>(code), {}};
    filter.resval.rstring = kind;
    return tzedSSGet(mode, nullptr, nullptr, &filter, set);
}

int lengthOf(long long const* set) {
    int length = 0;
    return tzedSSLength(set, &length) == Tzad::ePromptNormal ? length : 0;
}

bool entityAt(long long const* set, int index, TzDbObjectId& id) {
    long long name[2] = {};
    return tzedSSName(set, index, name) == Tzad::ePromptNormal &&
           tzdbGetObjectId(id, name) == Tzad::eOk;
}
