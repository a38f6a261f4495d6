#pragma once

#include "tz/export.h"

// Rules of symbol names: those of layers, styles, line types and blocks.
//
//   if (TzDbSymbolUtilities::servicesPtr()->compareSymbolName(L"notes", L"NOTES") == 0) ...

class TZ_API TzDbSymbolUtilityServices {
public:
    virtual ~TzDbSymbolUtilityServices() = default;
    // [any] 0 when both texts name the same symbol, without regard to case; below 0 when the first
    // sorts before the second, above 0 when it sorts after the second.
    [[nodiscard]] virtual int compareSymbolName(wchar_t const* first,
                                                wchar_t const* second) const = 0;
};

class TZ_API TzDbSymbolUtilities {
public:
    // [any] Never null; lives with the process.
    [[nodiscard]] static TzDbSymbolUtilityServices const* servicesPtr();
};
