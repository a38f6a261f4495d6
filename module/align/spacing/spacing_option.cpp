#include "module/align/spacing/spacing_option.h"

void TzMTextAlignOption::calculateOffsets(Offsets& offsets,
                                          TzGeMatrix3d const& coordSystem,
                                          Positions const& newPositions,
                                          Entities const& entities,
                                          Indices const& sortedIndices) {
    offsets.resize(newPositions.size());
    for (std::size_t i = 0; i < newPositions.size(); ++i)
        offsets[i] = newPositions[i] - coordSystem * entities[sortedIndices[i]]->referencePoint();
}
