#pragma once

#include "module/align/spacing/spacing_option.h"

// Texts one after another along the line, with the same gap between the boxes of neighbours. The
// first one's reference point goes to the first point.
class TzMTextAlignOptionEvenly : public TzMTextAlignOption {
public:
    [[nodiscard]] Offsets createOffsetFor(Entities const& entities,
                                          Indices const& sortedIndices,
                                          TzGeLineSeg3d baseline,
                                          TzGeMatrix3d const& coordSystem) override;
    bool doSomething() override;
    // The gap is TEXTALIGNSPACINGVALUE.
    void loadDefaultSettings() override;
    void saveAsDefaultSettings() override;

protected:
    // Which way the line runs on the working plane. One along an axis counts as running right when
    // it does not run left, and as running down unless it runs up.
    enum class BaseLineDirection { kUpLeft, kUpRight, kDownLeft, kDownRight };

    // Brings the gap up to date for a line of that length.
    virtual void calculateSpace(BaseLineDirection direction, double length);
    // The gap in drawing units; negative where texts overlap.
    [[nodiscard]] virtual double spacingValue() const;
    void setSpacingValue(double space) { m_space = space; }

    // How much of the line the texts at i and i + 1 take up between their reference points when
    // their boxes touch; 0 for the last one.
    [[nodiscard]] double calculateOccupiedSizeOnBaseline(BaseLineDirection direction,
                                                         std::size_t i) const;
    [[nodiscard]] std::size_t textCount() const { return m_projectionSizes.size(); }

private:
    // Lengths along the line from a text's reference point to where the line meets the sides of its
    // box; huge for sides that it never meets.
    struct ProjectionSize {
        double up;
        double down;
        double left;
        double right;
    };

    [[nodiscard]] static BaseLineDirection
    calculateBaseLineDirection(TzGeLineSeg3d const& baseline, TzGeMatrix3d const& coordSystem);
    void calculateEntityProjectionSizeOnBaseLine(Entities const& entities,
                                                 Indices const& sortedIndices,
                                                 TzGeLineSeg3d const& baseline,
                                                 TzGeMatrix3d const& coordSystem);
    void calculateNewPosition(Positions& positions,
                              BaseLineDirection direction,
                              TzGeLineSeg3d const& baseline) const;

    std::vector<ProjectionSize> m_projectionSizes;  // in the order of the sorted indices
    double m_space = 0;
};

// Fills the line: the gap is what brings the last text's reference point to the second point. On a
// line that is too short the texts overlap.
class TzMTextAlignOptionDistribute : public TzMTextAlignOptionEvenly {
public:
    [[nodiscard]] TzString const& name() const override;
    [[nodiscard]] TzString const& description() const override;
    // The gap is no setting of the user's.
    void loadDefaultSettings() override {}
    void saveAsDefaultSettings() override {}

protected:
    void calculateSpace(BaseLineDirection direction, double length) override;
};

// A gap that the user gives; the second point gives only the direction.
class TzMTextAlignOptionSpecificSpace : public TzMTextAlignOptionEvenly {
public:
    [[nodiscard]] TzString const& name() const override;
    // With the gap in force.
    [[nodiscard]] TzString const& description() const override;
    // Asks for the gap; false when the question was cancelled or failed, which keeps the gap.
    bool doSomething() override;
};
