#include "tz/mte/scale_correction.h"

#include "module/host_calls/truncate.h"
#include "module/markup/shared/wrapping.h"

namespace {

bool isRemembered(int twips) {
    return twips >= 0 && twips <= 0xFFFF;
}

std::uint16_t keyOf(int twips) {
    return static_cast<std::uint16_t>(twips);
}

}  // namespace

int CScaleCorrection::ScaleUnitsToTwips(double units) {
    int twips = truncatedToInt(m_nScaleTwips / m_dScaleUnits * units);
    if (units > 0 && twips == 0) twips = 1;
    if (m_bRoundToTen) twips = wrappingSum(twips, 9) / 10 * 10;
    if (isRemembered(twips)) m_map.try_emplace(keyOf(twips), units);
    return twips;
}

double CScaleCorrection::ScaleTwipsToUnits(int twips) const {
    double units = 0.0;
    return LookupUnits(twips, units) ? units : twips / (m_nScaleTwips / m_dScaleUnits);
}

bool CScaleCorrection::LookupUnits(int twips, double& units) const {
    if (!isRemembered(twips)) return false;
    auto const at = m_map.find(keyOf(twips));
    if (at == m_map.end()) return false;
    units = at->second;
    return true;
}

void CScaleCorrection::AddScale(int twips, double units) {
    if (isRemembered(twips)) m_map[keyOf(twips)] = units;
}

void CScaleCorrection::RescaleUnits(double units) {
    for (auto& pair : m_map)
        pair.second *= units / m_dScaleUnits;
    m_dScaleUnits = units;
}
