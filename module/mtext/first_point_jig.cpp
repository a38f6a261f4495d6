#include "module/mtext/first_point_jig.h"

#include "module/geometry/plain_edges.h"
#include "module/geometry/user_axes.h"
#include "module/mtext/sample_text.h"
#include "module/styles/style_rules.h"
#include "tz/rx/variables.h"

namespace {

// With this form of the cursor the text stays hidden until the cursor moves.
constexpr int kCursorThatHides = 1;

bool cursorHidesText() {
    static TzRxVariable const* const cursorType =
        TzRxVariablesDictionary::get()->getVariable(L"CURSORTYPE");
    return cursorType && cursorType->intValue() == kCursorThatHides;
}

}  // namespace

CTzsMtextFirstPointJig::CTzsMtextFirstPointJig(TzGePoint3d const&) {
    updateVectors();
    m_dTextSize = ComputeTextSize();
    m_bVertical = isCurrentStyleVertical();
}

void CTzsMtextFirstPointJig::updateVectors() {
    UserAxes const axes = activeUserAxes();
    m_vecUcsX = axes.x;
    m_vecUcsY = axes.y;
    m_vecNormal = axes.normal;
    SetRotation(rotationOfCurrentStyle());
}

void CTzsMtextFirstPointJig::SetRotation(double radians) {
    m_dRotation = radians;
    UserAxes const frame = UserAxes{m_vecUcsX, m_vecUcsY, m_vecNormal}.turned(radians);
    m_vecX = frame.x;
    m_vecY = frame.y;
}

TzEdJig::DragStatus CTzsMtextFirstPointJig::OnSample(TzEdJig& jig) {
    if (m_bFirstSample && cursorHidesText()) m_bHidden = true;
    TzGePoint3d point;
    TzEdJig::DragStatus status = jig.acquirePoint(point);
    if (m_bFirstSample && m_bHidden) m_ptCursor = point;
    if (status == TzEdJig::kNormal) {
        if (point.isEqualTo(m_ptCursor)) {
            status = TzEdJig::kNoChange;
        } else {
            m_ptCursor = point;
            updateVectors();
            m_bHidden = false;
        }
    }
    m_bFirstSample = false;
    return status;
}

bool CTzsMtextFirstPointJig::subWorldDraw(TzGiWorldDraw* draw) {
    if (m_bHidden) return true;
    drawPlainEdges(*draw);
    TzGiSubEntityTraits& traits = draw->subEntityTraits();
    int const colorBefore = traits.color();
    traits.setColor(kSampleColor);
    traits.setLineWeight(0);

    UserAxes const frame{m_vecX, m_vecY, m_vecNormal};
    CTzsJigEntity::subWorldDraw(draw);
    TzGiTextStyle const style = sampleTextStyle(m_dTextSize, m_bVertical);
    TzGePoint3d const position = m_bVertical ? m_ptCursor + frame.x * (0.5 * m_dTextSize)
                                             : m_ptCursor - frame.y * m_dTextSize;
    TzString const text = sampleText();
    if (!text.isEmpty()) drawSampleText(*draw, text, position, frame.normal, frame.x, style);
    traits.setColor(colorBefore);
    return true;
}
