#pragma once

#include <vector>

#include "module/align/spacing/aligned_entity.h"
#include "tz/ge/line_seg3d.h"
#include "tz/text/string.h"

// Decides where each text goes along the line of an alignment. The options of a run are kept by a
// TzMTextAlignOptionsFactory.
//
//   option.createOffsetFor(entities, sortedIndices, baseline, workingSystem);   // one for each
class TzMTextAlignOption {
public:
    using Entities = std::vector<TzMTextAlignManipulatorEntity*>;
    using Indices = std::vector<unsigned long>;  // of entities, in order along the line
    using Offsets = std::vector<TzGeVector3d>;
    using Positions = std::vector<TzGePoint3d>;

    TzMTextAlignOption() = default;
    TzMTextAlignOption(TzMTextAlignOption const&) = delete;
    TzMTextAlignOption& operator=(TzMTextAlignOption const&) = delete;
    virtual ~TzMTextAlignOption() = default;

    // The option becomes the one in force.
    virtual void initialize() {}
    // For each index, in their order, how far its text goes from where it stood at first, in world
    // coordinates. `coordSystem` maps the working plane, in which the texts were measured, to the
    // world; the baseline lies in the world, from the first point to the second.
    [[nodiscard]] virtual Offsets createOffsetFor(Entities const& entities,
                                                  Indices const& sortedIndices,
                                                  TzGeLineSeg3d baseline,
                                                  TzGeMatrix3d const& coordSystem) = 0;
    // The same in every language.
    [[nodiscard]] virtual TzString const& name() const = 0;
    // As the reports show it.
    [[nodiscard]] virtual TzString const& description() const = 0;
    // Asks what the option needs to know whenever the user chooses it; whether it got that.
    virtual bool doSomething() { return false; }
    virtual void loadDefaultSettings() {}
    virtual void saveAsDefaultSettings() {}
    // The last line cannot be used; then no text is to be moved, and the message says why.
    [[nodiscard]] virtual bool hasError() const { return false; }
    virtual void showErrorMessage() const {}

protected:
    // `offsets` takes the way of each text from its reference point to its new position, both in
    // the order of the indices.
    static void calculateOffsets(Offsets& offsets,
                                 TzGeMatrix3d const& coordSystem,
                                 Positions const& newPositions,
                                 Entities const& entities,
                                 Indices const& sortedIndices);
};
