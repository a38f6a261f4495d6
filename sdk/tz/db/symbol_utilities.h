#pragma once

#include "tz/export.h"

// Rules of symbol names: those of layers, styles, line types and blocks.
//
//   if (TzDbSymbolUtilities::servicesPtr()->compareSymbolName(L"notes", L"NOTES") == 0) ...

class TZ_API TzDbSymbolUtilityServices {
public:
    virtual ~TzDbSymbolUtilityServices() = default;
    // [any] 0 when both texts name the same symbol, which case does not decide; below or above 0 as
    // the first stands before or after the second.
    [[nodiscard]] virtual int compareSymbolName(wchar_t const* first,
                                                wchar_t const* second) const = 0;
};

class TZ_API TzDbSymbolUtilities {
public:
    // [any] Never null; lives with the process.
    [[nodiscard]] static TzDbSymbolUtilityServices const* servicesPtr();
};
