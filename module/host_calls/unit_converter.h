#pragma once

#include "tz/text/string.h"

// Lengths and angles as text in the drawing's units, and back.
//
//   CLinearUnitConverter const length(kLinearUnitsOfDrawing, kPrecisionOfDrawing);
//   TzString const shown = length.MapDoubleToUnit(15.5);  // "15.5000"
//
// No failure is reported: a value that the host cannot write gives the empty text, and a text that
// it cannot read gives 0. A text read back from a low precision differs from the value that it came
// from.

enum LinearUnits : int {
    kLinearUnitsOfDrawing = -1,  // the variable LUNITS
    kScientific = 1,
    kDecimal,
    kFeetAndInches,
    kFeetAndFractions,
    kFractional,
};
enum RadialUnits : int {
    kRadialUnitsOfDrawing = -1,  // the variable AUNITS
    kDegrees = 0,
    kDegreesMinutesSeconds,
    kGrads,
    kRadians,
    kSurveyor,
};
// The variables LUPREC and AUPREC.
inline constexpr int kPrecisionOfDrawing = -1;

class CUnitConverter {
public:
    virtual ~CUnitConverter() = default;
    // The text, cut at 127 characters; empty when the host has none.
    [[nodiscard]] virtual TzString MapDoubleToUnit(double value) const = 0;
    // The value, or 0 when the text is no such number. `ok` tells which; it may be null.
    [[nodiscard]] virtual double MapUnitToDouble(TzString const& text, bool* ok) const = 0;
    // The variable's whole number, 0 for one that has none.
    [[nodiscard]] static int GetVariable(wchar_t const* name);

protected:
    CUnitConverter(int theUnits, int thePrecision) : units(theUnits), precision(thePrecision) {}

    int units;
    int precision;
};

// Lengths. Units outside 1 to 5 become decimal.
class CLinearUnitConverter : public CUnitConverter {
public:
    CLinearUnitConverter(LinearUnits theUnits, int thePrecision);
    [[nodiscard]] TzString MapDoubleToUnit(double value) const override;
    [[nodiscard]] double MapUnitToDouble(TzString const& text, bool* ok) const override;
};

// Angles in radians. Units outside 0 to 4 become degrees with minutes and seconds.
class CRadialUnitConverter : public CUnitConverter {
public:
    CRadialUnitConverter(RadialUnits theUnits, int thePrecision);
    [[nodiscard]] TzString MapDoubleToUnit(double value) const override;
    [[nodiscard]] double MapUnitToDouble(TzString const& text, bool* ok) const override;
};
