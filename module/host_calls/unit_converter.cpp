#include "module/host_calls/unit_converter.h"

#include "tz/ed/units.h"
#include "tz/ed/variables.h"
#include "tz/rx/status.h"

namespace {

constexpr int kLongestText = 127;

struct UnitLimits {
    wchar_t const* unitsVariable;
    wchar_t const* precisionVariable;
    int first;
    int last;
    int fallback;
};
constexpr UnitLimits kLinear{L"LUNITS", L"LUPREC", kScientific, kFractional, kDecimal};
constexpr UnitLimits kRadial{L"AUNITS", L"AUPREC", kDegrees, kSurveyor, kDegreesMinutesSeconds};

int unitsWithin(UnitLimits const& limits, int units) {
    if (units == -1) units = CUnitConverter::GetVariable(limits.unitsVariable);
    return units < limits.first || units > limits.last ? limits.fallback : units;
}

int precisionOf(UnitLimits const& limits, int precision) {
    return precision == kPrecisionOfDrawing ? CUnitConverter::GetVariable(limits.precisionVariable)
                                            : precision;
}

using ToText = int (*)(double, int, int, TzString&);
using ToValue = int (*)(wchar_t const*, int, double*);

TzString textOf(ToText convert, double value, int units, int precision) {
    TzString text;
    if (convert(value, units, precision, text) != Tzad::ePromptNormal) return TzString();
    return text.left(kLongestText);
}

double valueOf(ToValue convert, TzString const& text, int units, bool* ok) {
    double value = 0.0;
    bool const read = convert(text, units, &value) == Tzad::ePromptNormal;
    if (ok) *ok = read;
    return read ? value : 0.0;
}

}  // namespace

int CUnitConverter::GetVariable(wchar_t const* name) {
    resbuf value{};
    if (tzedGetVar(name, &value) != Tzad::ePromptNormal) return 0;
    if (value.restype == Tzad::eResultShort) return value.resval.rint;
    if (value.restype == Tzad::eResultLong) return value.resval.rlong;
    if (value.restype == Tzad::eResultString) tzutDelString(value.resval.rstring);
    return 0;
}

CLinearUnitConverter::CLinearUnitConverter(LinearUnits theUnits, int thePrecision)
    : CUnitConverter(unitsWithin(kLinear, theUnits), precisionOf(kLinear, thePrecision)) {}

TzString CLinearUnitConverter::MapDoubleToUnit(double value) const {
    return textOf(tzdbRToS, value, units, precision);
}

double CLinearUnitConverter::MapUnitToDouble(TzString const& text, bool* ok) const {
    return valueOf(tzdbDisToF, text, units, ok);
}

CRadialUnitConverter::CRadialUnitConverter(RadialUnits theUnits, int thePrecision)
    : CUnitConverter(unitsWithin(kRadial, theUnits), precisionOf(kRadial, thePrecision)) {}

TzString CRadialUnitConverter::MapDoubleToUnit(double value) const {
    return textOf(tzdbAngToS, value, units, precision);
}

double CRadialUnitConverter::MapUnitToDouble(TzString const& text, bool* ok) const {
    return valueOf(tzdbAngToF, text, units, ok);
}
