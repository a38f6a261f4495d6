#include "module/align/spacing/even_spacing.h"

#include <algorithm>
#include <cmath>

#include "module/align/spacing/setting_variables.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/prompts.h"
#include "tz/rx/status.h"

namespace {

constexpr wchar_t kSpacingVariable[] = L"TEXTALIGNSPACINGVALUE";

// A pair of sides that the line never meets is twice this far away: the sum of two such lengths is
// still a number, and loses every comparison.
constexpr double kFarAway = 1.7e307;

TzGeVector3d directionOnPlane(TzGeLineSeg3d baseline, TzGeMatrix3d const& coordSystem) {
    return baseline.transformBy(coordSystem.inverse()).direction();
}

// Lengths along a line from a point to the sides of a box, of which the coordinates across the
// sides are given; `slope` is the sine or cosine of the line's angle to the sides.
struct SideLengths {
    double toLow;
    double toHigh;

    static SideLengths along(double slope, double point, double low, double high) {
        if (std::abs(slope) < TzGeContext::gTol.equalPoint()) return {2 * kFarAway, 2 * kFarAway};
        return {std::abs(low / slope - point / slope), std::abs(high / slope - point / slope)};
    }
};

}  // namespace

TzMTextAlignOption::Offsets
TzMTextAlignOptionEvenly::createOffsetFor(Entities const& entities,
                                          Indices const& sortedIndices,
                                          TzGeLineSeg3d baseline,
                                          TzGeMatrix3d const& coordSystem) {
    BaseLineDirection const direction = calculateBaseLineDirection(baseline, coordSystem);
    calculateEntityProjectionSizeOnBaseLine(entities, sortedIndices, baseline, coordSystem);
    calculateSpace(direction, baseline.length());
    Positions positions;
    calculateNewPosition(positions, direction, baseline);
    Offsets offsets;
    calculateOffsets(offsets, coordSystem, positions, entities, sortedIndices);
    return offsets;
}

TzMTextAlignOptionEvenly::BaseLineDirection
TzMTextAlignOptionEvenly::calculateBaseLineDirection(TzGeLineSeg3d const& baseline,
                                                     TzGeMatrix3d const& coordSystem) {
    TzGeVector3d const along = directionOnPlane(baseline, coordSystem);
    double const tolerance = TzGeContext::gTol.equalPoint();
    bool const runsRight = along.x >= tolerance;
    if (along.y < tolerance)
        return runsRight ? BaseLineDirection::kDownRight : BaseLineDirection::kDownLeft;
    return runsRight ? BaseLineDirection::kUpRight : BaseLineDirection::kUpLeft;
}

void TzMTextAlignOptionEvenly::calculateEntityProjectionSizeOnBaseLine(
    Entities const& entities,
    Indices const& sortedIndices,
    TzGeLineSeg3d const& baseline,
    TzGeMatrix3d const& coordSystem) {
    double const angle = directionOnPlane(baseline, coordSystem).angleTo(TzGeVector3d::kXAxis);
    double const sine = std::sin(angle);
    double const cosine = std::cos(angle);
    m_projectionSizes.resize(sortedIndices.size());
    for (std::size_t i = 0; i < sortedIndices.size(); ++i) {
        TzMTextAlignManipulatorEntity const& entity = *entities[sortedIndices[i]];
        TzGePoint3d const& point = entity.referencePoint();
        TzGePoint3d low;
        TzGePoint3d high;
        entity.boundingBox().getMinMaxPoints(low, high);
        SideLengths const upright = SideLengths::along(sine, point.y, low.y, high.y);
        SideLengths const level = SideLengths::along(cosine, point.x, low.x, high.x);
        m_projectionSizes[i] = {upright.toHigh, upright.toLow, level.toLow, level.toHigh};
    }
}

// Of the two ways out of both boxes, through their upright and through their level extent, the
// shorter one is where they touch.
double TzMTextAlignOptionEvenly::calculateOccupiedSizeOnBaseline(BaseLineDirection direction,
                                                                 std::size_t i) const {
    if (i + 1 >= m_projectionSizes.size()) return 0;
    ProjectionSize const& here = m_projectionSizes[i];
    ProjectionSize const& next = m_projectionSizes[i + 1];
    switch (direction) {
    case BaseLineDirection::kUpLeft: return std::min(here.up + next.down, here.left + next.right);
    case BaseLineDirection::kUpRight: return std::min(here.up + next.down, here.right + next.left);
    case BaseLineDirection::kDownLeft: return std::min(here.down + next.up, here.left + next.right);
    case BaseLineDirection::kDownRight:
        return std::min(here.down + next.up, here.right + next.left);
    }
    return 0;
}

void TzMTextAlignOptionEvenly::calculateNewPosition(Positions& positions,
                                                    BaseLineDirection direction,
                                                    TzGeLineSeg3d const& baseline) const {
    TzGePoint3d running = baseline.startPoint();
    TzGeVector3d const along = baseline.direction();
    positions.resize(textCount());
    for (std::size_t i = 0; i < positions.size(); ++i) {
        positions[i] = running;
        running += along * (calculateOccupiedSizeOnBaseline(direction, i) + m_space);
    }
}

void TzMTextAlignOptionEvenly::calculateSpace(BaseLineDirection, double) {}

double TzMTextAlignOptionEvenly::spacingValue() const {
    return m_space;
}

bool TzMTextAlignOptionEvenly::doSomething() {
    return true;
}

void TzMTextAlignOptionEvenly::loadDefaultSettings() {
    m_space = getSysVarDouble(kSpacingVariable, 0.0);
}

void TzMTextAlignOptionEvenly::saveAsDefaultSettings() {
    (void)setSysVarDouble(kSpacingVariable, spacingValue());  // if refused, the old gap is kept
}

// With one text there is no gap, so the result of this division is not used.
void TzMTextAlignOptionDistribute::calculateSpace(BaseLineDirection direction, double length) {
    double occupied = 0;
    for (std::size_t i = 0; i < textCount(); ++i)
        occupied += calculateOccupiedSizeOnBaseline(direction, i);
    setSpacingValue((length - occupied) / (static_cast<double>(textCount()) - 1.0));
}

TzString const& TzMTextAlignOptionDistribute::name() const {
    static TzString const myName(L"Distribute");
    return myName;
}

TzString const& TzMTextAlignOptionDistribute::description() const {
    static TzString description;
    if (description.isEmpty()) description = gStringTable[kText.reportDistribute];
    return description;
}

TzString const& TzMTextAlignOptionSpecificSpace::name() const {
    static TzString const myName(L"SpecificSpace");
    return myName;
}

TzString const& TzMTextAlignOptionSpecificSpace::description() const {
    static TzString description;
    description.format(gStringTable[kText.reportSet], spacingValue());
    return description;
}

bool TzMTextAlignOptionSpecificSpace::doSomething() {
    double space = 0;
    int const status = tzedGetDist(
        nullptr, TzString::formatted(gStringTable[kText.spacePrompt], spacingValue()), &space);
    if (status == Tzad::ePromptNormal) setSpacingValue(space);
    return status == Tzad::ePromptNormal || status == Tzad::ePromptNone;
}
