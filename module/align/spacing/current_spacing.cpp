#include "module/align/spacing/current_spacing.h"

#include <algorithm>
#include <numbers>

#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/print.h"
#include "tz/ge/line3d.h"

void TzMTextAlignOptionCurrentSpace::initialize() {
    m_hasError = false;
}

// An angle of one degree is wide enough, also where the rounding of the points makes it a hair
// less.
TzMTextAlignOption::Offsets
TzMTextAlignOptionCurrentSpace::createOffsetFor(Entities const& entities,
                                                Indices const& sortedIndices,
                                                TzGeLineSeg3d baseline,
                                                TzGeMatrix3d const& coordSystem) {
    TzGeVector3d const extension = extensionLineDirection(coordSystem);
    TzGeVector3d const along = baseline.direction();
    double const angle = std::min(along.angleTo(extension), along.angleTo(-extension));
    m_hasError = angleThreshold() - angle > TzGeContext::gTol.equalVector();
    if (m_hasError) return Offsets(entities.size());
    Positions positions;
    calculateNewPosition(positions, entities, sortedIndices, extension, baseline, coordSystem);
    Offsets offsets;
    calculateOffsets(offsets, coordSystem, positions, entities, sortedIndices);
    return offsets;
}

double TzMTextAlignOptionCurrentSpace::angleThreshold() {
    static constexpr double threshold = std::numbers::pi / 180.0;
    return threshold;
}

void TzMTextAlignOptionCurrentSpace::calculateNewPosition(Positions& positions,
                                                          Entities const& entities,
                                                          Indices const& sortedIndices,
                                                          TzGeVector3d const& extension,
                                                          TzGeLineSeg3d const& baseline,
                                                          TzGeMatrix3d const& coordSystem) {
    TzGeLine3d const line(baseline.pointOnLine(), baseline.direction());
    positions.resize(sortedIndices.size());
    for (std::size_t i = 0; i < sortedIndices.size(); ++i) {
        TzGePoint3d const from = coordSystem * entities[sortedIndices[i]]->referencePoint();
        // The lines cross, since their angle is wide enough; the origin stands for a failure.
        (void)line.intersectWith(TzGeLine3d(from, extension), positions[i]);
    }
}

bool TzMTextAlignOptionCurrentSpace::hasError() const {
    return m_hasError;
}

void TzMTextAlignOptionCurrentSpace::showErrorMessage() const {
    tzutPrintf(L"%ls", gStringTable[kText.alignedAcross].kwszPtr());
}

TzString const& TzMTextAlignOptionCurrentSpaceHorizontal::name() const {
    static TzString const myName(L"CurrentSpaceHorizontal");
    return myName;
}

TzString const& TzMTextAlignOptionCurrentSpaceHorizontal::description() const {
    static TzString description;
    if (description.isEmpty()) description = gStringTable[kText.reportVertical];
    return description;
}

TzGeVector3d TzMTextAlignOptionCurrentSpaceHorizontal::extensionLineDirection(
    TzGeMatrix3d const& coordSystem) const {
    return coordSystem.yAxis();
}

TzString const& TzMTextAlignOptionCurrentSpaceVertical::name() const {
    static TzString const myName(L"CurrentSpaceVertical");
    return myName;
}

TzString const& TzMTextAlignOptionCurrentSpaceVertical::description() const {
    static TzString description;
    if (description.isEmpty()) description = gStringTable[kText.reportHorizontal];
    return description;
}

TzGeVector3d TzMTextAlignOptionCurrentSpaceVertical::extensionLineDirection(
    TzGeMatrix3d const& coordSystem) const {
    return coordSystem.xAxis();
}
