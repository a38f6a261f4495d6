#include "module/host_calls/selection_sets.h"

#include "tz/ed/selection.h"
#include "tz/rx/status.h"

int lengthOf(long long const* set) {
    int length = 0;
    return tzedSSLength(set, &length) == Tzad::ePromptNormal ? length : 0;
}

bool entityAt(long long const* set, int index, TzDbObjectId& id) {
    long long name[2] = {};
    return tzedSSName(set, index, name) == Tzad::ePromptNormal &&
           tzdbGetObjectId(id, name) == Tzad::eOk;
}
