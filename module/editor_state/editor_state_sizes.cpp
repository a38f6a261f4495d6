// Lengths of a session: drawing units, twips of font sizes, twips of margins.

#include "module/host_calls/truncate.h"
#include "module/host_calls/unit_converter.h"
#include "tz/mte/editor_state.h"
#include "tz/mte/globals.h"

double CMTextEditorState::GetMaximumSize() const {
    return m_fontScale.ScaleTwipsToUnits(m_nMaximumTwipSize);
}

double CMTextEditorState::GetMinimumSize() const {
    return m_fontScale.ScaleTwipsToUnits(m_nMinimumTwipSize);
}

double CMTextEditorState::TwipsToUnits(int twips, signed char bFont) const {
    return (bFont ? m_fontScale : m_marginScale).ScaleTwipsToUnits(twips);
}

int CMTextEditorState::UnitsToTwips(double units, signed char bFont) {
    return (bFont ? m_fontScale : m_marginScale).ScaleUnitsToTwips(units);
}

// The text form does the rounding: the length is written in the units and the precision in force
// and read back.
int CMTextEditorState::TwipsAdjustedForLinearUnits(int twips) {
    CLinearUnitConverter const units(kLinearUnitsOfDrawing, kPrecisionOfDrawing);
    TzString const shown = units.MapDoubleToUnit(m_fontScale.ScaleTwipsToUnits(twips));
    return m_fontScale.ScaleUnitsToTwips(units.MapUnitToDouble(shown, nullptr));
}

int CMTextEditorState::CalcMarginFromWidth(double width) {
    double const ratio = width / g_dTextSize / m_dCharWidth / m_dTracking / g_dWidthFactor;
    return truncatedToInt(UnitsToTwips(g_dTextSize, 1) * ratio * gdTweakFactor);
}

double CMTextEditorState::CalcWidthFromMargin(int margin) {
    return margin / gdTweakFactor / UnitsToTwips(g_dTextSize, 1) * m_dCharWidth * m_dTracking *
           g_dWidthFactor * g_dTextSize;
}
