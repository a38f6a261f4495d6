#include "module/styles/line_spacing.h"

#include "module/host_calls/sys_var.h"
#include "module/host_calls/unit_converter.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"

namespace {

CLinearUnitConverter drawingUnits() {
    return CLinearUnitConverter(kLinearUnitsOfDrawing, kPrecisionOfDrawing);
}

// A limit as the user sees it: the factor of its distance after rounding.
double shownLimit(double limit, double distance) {
    CLinearUnitConverter const units = drawingUnits();
    return units.MapUnitToDouble(units.MapDoubleToUnit(limit * distance), nullptr) / distance;
}

}  // namespace

double GetLineSpacingFactor() {
    return CTzadSysVar::GetDouble(L"TSPACEFAC");
}

bool SetLineSpacingFactor(double factor) {
    return CTzadSysVar::SetDouble(L"TSPACEFAC", factor);
}

TzDb::LineSpacingStyle GetLineSpacingStyle() {
    return static_cast<TzDb::LineSpacingStyle>(CTzadSysVar::GetInt(L"TSPACETYPE"));
}

bool SetLineSpacingStyle(TzDb::LineSpacingStyle style) {
    return CTzadSysVar::SetInt(L"TSPACETYPE", style);
}

bool ValidateLineSpacingFactor(double factor) {
    return kSmallestLineSpacingFactor <= factor && factor <= kLargestLineSpacingFactor;
}

void FixLineSpacingFactor(double& factor, double textHeight) {
    double const distance = textHeight * kSingleLineDistance;
    if (factor >= shownLimit(kSmallestLineSpacingFactor, distance) &&
        factor < kSmallestLineSpacingFactor)
        factor = kSmallestLineSpacingFactor;
    if (shownLimit(kLargestLineSpacingFactor, distance) >= factor &&
        factor > kLargestLineSpacingFactor)
        factor = kLargestLineSpacingFactor;
}

TzString InvalidSpacingFactorMessage(double textHeight) {
    double const distance = textHeight * kSingleLineDistance;
    CLinearUnitConverter const units = drawingUnits();
    TzString const least = units.MapDoubleToUnit(kSmallestLineSpacingFactor * distance);
    TzString const most = units.MapDoubleToUnit(kLargestLineSpacingFactor * distance);
    TzString const leastFactor = TzString::formatted(L"%g", kSmallestLineSpacingFactor);
    TzString const mostFactor = TzString::formatted(L"%g", kLargestLineSpacingFactor);
    return TzString::formatted(gStringTable[kText.invalidLineSpacing], least.kwszPtr(),
                               leastFactor.kwszPtr(), most.kwszPtr(), mostFactor.kwszPtr());
}
