#pragma once

#include <cstdint>
#include <map>

// Converts lengths between drawing units and twips (1/20 point) and remembers each pair, so that a
// twips value that returns from the editor becomes the exact double it came from.
//
//   CScaleCorrection scale(1);      // 1: round twips up to tens, as font sizes need
//   scale.SetScaleTwips(280);
//   scale.SetScaleUnits(0.2);       // 280 twips stand for 0.2 units
//   scale.ScaleUnitsToTwips(0.2);   // 280
//   scale.ScaleTwipsToUnits(280);   // exactly 0.2
//
// Only 0 to 65535 twips are remembered. Without a scale the results are those of a division by zero
// in floating point. Not thread-safe. Never throws but for memory.
class CScaleCorrection {
public:
    explicit CScaleCorrection(signed char bRoundToTen) : m_bRoundToTen(bRoundToTen) {}

    // The reference size, in both measures.
    void SetScaleTwips(int twips) { m_nScaleTwips = twips; }
    void SetScaleUnits(double units) { m_dScaleUnits = units; }
    [[nodiscard]] int GetScaleTwips() const { return m_nScaleTwips; }

    // Truncated toward zero, but for a positive length at least 1. The first length of each twips
    // value is remembered.
    int ScaleUnitsToTwips(double units);
    // The remembered length, else by the factor.
    [[nodiscard]] double ScaleTwipsToUnits(int twips) const;
    // False, with `units` as it was, when nothing is remembered.
    [[nodiscard]] bool LookupUnits(int twips, double& units) const;
    // Remembers a pair, in the place of one of the same twips.
    void AddScale(int twips, double units);
    // Makes `units` the reference size and scales what is remembered along.
    void RescaleUnits(double units);

private:
    int m_nScaleTwips = 0;
    double m_dScaleUnits = 0.0;
    signed char m_bRoundToTen;
    std::map<std::uint16_t, double> m_map;
};
