#include "module/align/spacing/alignment_pass.h"

#include <algorithm>
#include <cmath>
#include <limits>

#include "tz/ge/line3d.h"

namespace {

// A text with the parameter of its foot on the line.
struct Foot {
    double param;
    unsigned long index;
};

// Far out the arithmetic may overflow to what is no number, which has no order; it comes last.
double orderOf(double param) {
    return std::isnan(param) ? std::numeric_limits<double>::infinity() : param;
}

}  // namespace

TzMTextAlignManipulatorGut::TzMTextAlignManipulatorGut(
    TzMTextAlignOption::Entities const& entities,
    TzMTextAlignManipulatorEntity* referenceEntity,
    TzMTextAlignOption* option,
    TzGeLineSeg3d const& baseline,
    TzGeMatrix3d const& coordSystem)
    : m_entities(entities), m_referenceEntity(referenceEntity), m_option(option),
      m_coordSystem(coordSystem), m_baseline(baseline) {}

void TzMTextAlignManipulatorGut::sortEntities(TzMTextAlignOption::Entities const& entities) {
    m_sortedIndices.clear();
    TzGeLine3d line(m_baseline.startPoint(), m_baseline.endPoint());
    line.transformBy(m_coordSystem.inverse());
    std::vector<Foot> feet;
    feet.reserve(entities.size());
    for (std::size_t i = 0; i < entities.size(); ++i) {
        TzGePoint3d const foot = line.getClosestPointTo(entities[i]->referencePoint());
        feet.push_back({orderOf(line.paramOf(foot)), i});
    }
    std::stable_sort(feet.begin(), feet.end(),
                     [](Foot const& a, Foot const& b) { return a.param < b.param; });
    m_sortedIndices.reserve(feet.size());
    for (Foot const& foot : feet)
        m_sortedIndices.push_back(foot.index);
}

void TzMTextAlignManipulatorGut::alignEntities() {
    if (!m_referenceEntity) {
        sortEntities(m_entities);
        align(m_entities);
        return;
    }
    TzMTextAlignOption::Entities others;
    for (TzMTextAlignManipulatorEntity* const entity : m_entities)
        if (entity->id() != m_referenceEntity->id()) others.push_back(entity);
    sortEntities(others);
    others.insert(others.begin(), m_referenceEntity);
    for (unsigned long& index : m_sortedIndices)
        ++index;
    m_sortedIndices.insert(m_sortedIndices.begin(), 0);
    align(others);
}

void TzMTextAlignManipulatorGut::align(TzMTextAlignOption::Entities const& entities) {
    TzMTextAlignOption::Offsets const offsets =
        m_option->createOffsetFor(entities, m_sortedIndices, m_baseline, m_coordSystem);
    if (offsets.size() != m_sortedIndices.size()) return;
    // Moved in the order of the list, as they lie in memory: with many texts that is what counts.
    TzMTextAlignOption::Offsets ofEach(entities.size());
    for (std::size_t i = 0; i < offsets.size(); ++i)
        ofEach[m_sortedIndices[i]] = offsets[i];
    for (std::size_t i = 0; i < entities.size(); ++i)
        entities[i]->move(ofEach[i]);
}
