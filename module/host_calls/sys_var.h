#pragma once

#include "tz/text/string.h"

class TzGePoint3d;

// System variables by type. Reading never fails loudly: what cannot be read, or has a type that
// does not convert, gives the neutral value. Names count without case.
//
//   double const height = CTzadSysVar::GetDouble(L"TEXTSIZE");
//   bool const stored = CTzadSysVar::SetInt(L"TSPACETYPE", 2);
class CTzadSysVar {
public:
    // The value as text: a real in its shortest form with up to six digits, a whole number in
    // decimal, a text as it is; empty for a point.
    [[nodiscard]] static TzString GetString(wchar_t const* name);
    // A real loses its decimals; 0 for a text or a point.
    [[nodiscard]] static int GetInt(wchar_t const* name);
    // 0 for a text or a point.
    [[nodiscard]] static double GetDouble(wchar_t const* name);

    // Write a variable of that type; false when the host refused. SetInt writes the low 16 bits.
    [[nodiscard]] static bool SetInt(wchar_t const* name, int value);
    [[nodiscard]] static bool SetDouble(wchar_t const* name, double value);
    [[nodiscard]] static bool SetPoint(wchar_t const* name, TzGePoint3d const& point);
};
