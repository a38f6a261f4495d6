#pragma once

#include "module/align/spacing/spacing_option.h"

// Each text slides along one axis of the working plane until its reference point is on the line, so
// that the distances along the other axis stay as they are. A line within one degree of the axis
// cannot be used: the texts then stay where they stood at first.
class TzMTextAlignOptionCurrentSpace : public TzMTextAlignOption {
public:
    void initialize() override;
    [[nodiscard]] Offsets createOffsetFor(Entities const& entities,
                                          Indices const& sortedIndices,
                                          TzGeLineSeg3d baseline,
                                          TzGeMatrix3d const& coordSystem) override;
    // Of the last line.
    [[nodiscard]] bool hasError() const override;
    void showErrorMessage() const override;

protected:
    // The axis along which the texts slide, in world coordinates.
    [[nodiscard]] virtual TzGeVector3d
    extensionLineDirection(TzGeMatrix3d const& coordSystem) const = 0;

private:
    [[nodiscard]] static double angleThreshold();
    static void calculateNewPosition(Positions& positions,
                                     Entities const& entities,
                                     Indices const& sortedIndices,
                                     TzGeVector3d const& extension,
                                     TzGeLineSeg3d const& baseline,
                                     TzGeMatrix3d const& coordSystem);

    bool m_hasError = false;
};

// Keeps the distances along X and slides along Y.
class TzMTextAlignOptionCurrentSpaceHorizontal : public TzMTextAlignOptionCurrentSpace {
public:
    [[nodiscard]] TzString const& name() const override;
    [[nodiscard]] TzString const& description() const override;

protected:
    [[nodiscard]] TzGeVector3d
    extensionLineDirection(TzGeMatrix3d const& coordSystem) const override;
};

// Keeps the distances along Y and slides along X.
class TzMTextAlignOptionCurrentSpaceVertical : public TzMTextAlignOptionCurrentSpace {
public:
    [[nodiscard]] TzString const& name() const override;
    [[nodiscard]] TzString const& description() const override;

protected:
    [[nodiscard]] TzGeVector3d
    extensionLineDirection(TzGeMatrix3d const& coordSystem) const override;
};
