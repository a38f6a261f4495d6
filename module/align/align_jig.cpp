#include "module/align/align_jig.h"

#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"

namespace {

constexpr int kRubberBand = 2;
constexpr auto kControls = static_cast<TzEdJig::UserInputControls>(
    TzEdJig::kGovernedByOrthoMode | TzEdJig::kNullResponseAccepted | TzEdJig::kAccept3dCoordinates);

}  // namespace

TzMTextAlignJig::TzMTextAlignJig(TzMTextAlignManipulator& manipulator)
    : m_manipulator(manipulator) {}

void TzMTextAlignJig::prepareForKeywords() {
    if (m_keywords.isEmpty()) m_keywords = gStringTable[kText.alignSecondPointKeywords];
}

void TzMTextAlignJig::preparePrompt() {
    prepareForKeywords();
    if (m_prompt.isEmpty()) m_prompt = gStringTable[kText.alignSecondPoint];
    setDispPrompt(m_prompt);
}

void TzMTextAlignJig::initForSampler() {
    setSpecialCursorType(kRubberBand);
    setUserInputControls(kControls);
    setKeywordList(m_keywords);
}

TzEdJig::DragStatus TzMTextAlignJig::sampler() {
    initForSampler();
    TzGePoint3d point;
    DragStatus const status = acquirePoint(point, m_manipulator.firstPoint());
    if (status != kNormal) return status;
    if (m_hasLastPoint && point == m_lastPoint) return kNoChange;
    m_manipulator.setSecondPoint(point);
    m_hasLastPoint = true;
    m_lastPoint = point;
    return kNormal;
}

bool TzMTextAlignJig::update() {
    m_manipulator.alignEntities();
    return true;
}

TzDbEntity* TzMTextAlignJig::entity() const {
    return &m_manipulator;
}
