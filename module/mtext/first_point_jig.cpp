#include "module/mtext/first_point_jig.h"

#include "module/access/style_rules.h"
#include "module/mtext/sample_text.h"
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

CTzsMtextFirstPointJig::CTzsMtextFirstPointJig(TzGePoint3d const&) : m_flow(flowOfCurrentStyle()) {
    updateVectors();
    m_dTextSize = ComputeTextSize();
}

void CTzsMtextFirstPointJig::updateVectors() {
    m_ucs = activeUserAxes();
    SetRotation(rotationOfCurrentStyle());
}

void CTzsMtextFirstPointJig::SetRotation(double radians) {
    m_dRotation = radians;
    m_frame = m_ucs.turned(radians);
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

    CTzsJigEntity::subWorldDraw(draw);
    TzGiTextStyle const style = sampleTextStyle(m_dTextSize, m_flow);
    TzGePoint3d const position = m_flow == LineFlow::vertical
                                     ? m_ptCursor + m_frame.x * (0.5 * m_dTextSize)
                                     : m_ptCursor - m_frame.y * m_dTextSize;
    TzString const text = sampleText();
    if (!text.isEmpty()) drawSampleText(*draw, text, position, m_frame.normal, m_frame.x, style);
    traits.setColor(colorBefore);
    return true;
}
