#include "module/commands/mtext_selection.h"

#include "tz/ed/selection.h"
#include "tz/rx/resbuf.h"

int selectMText(long long* set, wchar_t const* mode, KindCode code) {
    wchar_t kind[] = L"MTEXT";
    resbuf filter{nullptr, static_cast<short>(code), {}};
    filter.resval.rstring = kind;
    return tzedSSGet(mode, nullptr, nullptr, &filter, set);
}
