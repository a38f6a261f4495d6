#include "module/mtext/rectangle_jig.h"

#include "module/geometry/attachments.h"
#include "module/geometry/plain_edges.h"
#include "module/host_calls/sys_var.h"
#include "module/mtext/sample_text.h"
#include "module/styles/style_rules.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/mte/easy_object.h"

namespace {

// The arrow's head over the height of the view.
constexpr double kArrowPerView = 0.03125;
constexpr int kLineColor = 7;
constexpr int kDragBoxCursor = 8;

TzDbDatabase& workingDatabase() {
    return *tzdbHostApplicationServices()->workingDatabase();
}

// Switches ortho mode off and, on every way out, back to what it was. A drawing that refuses keeps
// its mode.
class WithoutOrtho {
public:
    WithoutOrtho() : before_(workingDatabase().orthomode()) {
        (void)workingDatabase().setOrthomode(false);
    }
    WithoutOrtho(WithoutOrtho const&) = delete;
    WithoutOrtho& operator=(WithoutOrtho const&) = delete;
    ~WithoutOrtho() { (void)workingDatabase().setOrthomode(before_); }

private:
    bool before_;
};

// How the edges of one row of attachment points are drawn: an edge on the attachment's side is
// closed, because the text grows away from it.
struct EdgeDrawing {
    void (CTzsMtextJig::*top)(TzGiWorldDraw*) const;
    void (CTzsMtextJig::*bottom)(TzGiWorldDraw*) const;
};
constexpr EdgeDrawing kEdgesByRow[] = {
    {&CTzsMtextJig::DrawClosedTop, &CTzsMtextJig::DrawOpenBottom},
    {&CTzsMtextJig::DrawOpenTop, &CTzsMtextJig::DrawOpenBottom},
    {&CTzsMtextJig::DrawOpenTop, &CTzsMtextJig::DrawClosedBottom},
};

}  // namespace

CTzsMtextJig::CTzsMtextJig(TzGePoint3d const& first) {
    m_dArrowSize = CTzadSysVar::GetDouble(L"VIEWSIZE") * kArrowPerView;
    UserAxes const axes = activeUserAxes();
    m_vecUcsX = axes.x;
    m_vecUcsY = axes.y;
    m_vecNormal = axes.normal;
    m_corners.bottomRight = first;
    SetBasePoint(first);
    SetRotation(rotationOfCurrentStyle());
    m_ptLastSample = first;
    m_solidLine = GetSolidLine();
    m_dTextSize = ComputeTextSize();
    m_bVertical = isCurrentStyleVertical();
}

void CTzsMtextJig::SetRotation(double radians) {
    m_dRotation = radians;
    UserAxes const turned = UserAxes{m_vecUcsX, m_vecUcsY, m_vecNormal}.turned(radians);
    m_vecX = turned.x;
    m_vecY = turned.y;
    SetStretchPoint(m_corners.bottomRight);
}

void CTzsMtextJig::SetStretchPoint(TzGePoint3d const& point) {
    stretchBox(m_corners, GetBasePoint(), point, frame());
    m_vecWidth = m_vecX * m_corners.topLeft.distanceTo(m_corners.topRight);
    m_vecHeight = m_vecY * m_corners.topLeft.distanceTo(m_corners.bottomLeft);
}

LineFlow CTzsMtextJig::flow() const {
    return m_bVertical ? LineFlow::vertical : LineFlow::horizontal;
}

double CTzsMtextJig::Width() const {
    return m_corners.topLeft.distanceTo(m_bVertical ? m_corners.bottomLeft : m_corners.topRight);
}

double CTzsMtextJig::Height() const {
    return m_corners.topLeft.distanceTo(m_bVertical ? m_corners.topRight : m_corners.bottomLeft);
}

void CTzsMtextJig::GetJigAttachPoint(TzGePoint3d& out) const {
    out = attachmentPoint(m_corners, m_vecWidth, m_vecHeight, m_nAttachment);
}

TzDbObjectId CTzsMtextJig::GetSolidLine() {
    EasyTable<TzDbLinetypeTable> table;
    if (workingDatabase().getLinetypeTable(table.object, TzDb::kForRead) != Tzad::eOk) return {};
    EasyIterator<TzDbLinetypeTable, TzDbLinetypeTableIterator> walk;
    if (table->newIterator(walk.object) != Tzad::eOk) return {};
    walk->start();
    EasyObject<TzDbLinetypeTableRecord> first;
    if (walk->getRecord(first.object, TzDb::kForRead) != Tzad::eOk) return {};
    return first->numDashes() == 0 ? first->objectId() : TzDbObjectId();
}

TzEdJig::DragStatus CTzsMtextJig::OnSample(TzEdJig& jig) {
    jig.setSpecialCursorType(kDragBoxCursor);
    TzGePoint3d point;
    TzEdJig::DragStatus status = TzEdJig::kNormal;
    {
        WithoutOrtho const free;
        status = jig.acquirePoint(point);
    }
    if (status != TzEdJig::kNormal) return status;
    if (point.isEqualTo(m_ptLastSample) && !m_bFirstSample) return TzEdJig::kNoChange;
    SetStretchPoint(point);
    m_ptLastSample = point;
    m_bFirstSample = false;
    return TzEdJig::kNormal;
}

bool CTzsMtextJig::subWorldDraw(TzGiWorldDraw* draw) {
    drawPlainEdges(*draw);
    TzGiSubEntityTraits& traits = draw->subEntityTraits();
    traits.setLineType(m_solidLine);
    traits.setLineWeight(0);
    traits.setColor(kLineColor);
    CTzsJigEntity::subWorldDraw(draw);
    for (BoxEdge const& side : edgesOf(m_corners, flow()).sides)
        DrawLine(draw, side.from, side.to);
    if (isAttachment(m_nAttachment)) {
        auto const row = static_cast<std::size_t>(placeOfAttachment(m_nAttachment).row);
        EdgeDrawing const& edges = kEdgesByRow[row];
        (this->*edges.top)(draw);
        (this->*edges.bottom)(draw);
    }
    drawSample(*draw);
    return true;
}

void CTzsMtextJig::DrawLine(TzGiWorldDraw* draw, TzGePoint3d const& a, TzGePoint3d const& b) {
    TzGePoint3d const ends[] = {a, b};
    draw->geometry().polyline(2, ends);
}

void CTzsMtextJig::DrawArrow(TzGiWorldDraw* draw,
                             TzGePoint3d const& a,
                             TzGePoint3d const& b,
                             bool flip) const {
    bool const roomy =
        m_vecHeight.length() > 2 * m_dArrowSize && m_vecWidth.length() > m_dArrowSize;
    if (!roomy) return;
    UserAxes axes = frame();
    if (flip) {
        axes.x.negate();
        axes.y.negate();
    }
    auto const outline = arrowOutline({a, b}, axes, flow(), m_dArrowSize);
    draw->geometry().polyline(static_cast<int>(outline.size()), outline.data());
}

void CTzsMtextJig::DrawClosedTop(TzGiWorldDraw* draw) const {
    BoxEdge const top = edgesOf(m_corners, flow()).top;
    DrawLine(draw, top.from, top.to);
}

void CTzsMtextJig::DrawClosedBottom(TzGiWorldDraw* draw) const {
    BoxEdge const bottom = edgesOf(m_corners, flow()).bottom;
    DrawLine(draw, bottom.from, bottom.to);
}

void CTzsMtextJig::DrawOpenTop(TzGiWorldDraw* draw) const {
    DrawClosedTop(draw);
    BoxEdge const top = edgesOf(m_corners, flow()).top;
    DrawArrow(draw, top.from, top.to, false);
}

void CTzsMtextJig::DrawOpenBottom(TzGiWorldDraw* draw) const {
    DrawClosedBottom(draw);
    BoxEdge const bottom = edgesOf(m_corners, flow()).bottom;
    DrawArrow(draw, bottom.from, bottom.to, true);
}

void CTzsMtextJig::drawSample(TzGiWorldDraw& draw) const {
    TzString const text = sampleText();
    if (text.isEmpty()) return;
    TzGiTextStyle const style = sampleTextStyle(m_dTextSize, m_bVertical);
    draw.subEntityTraits().setColor(kSampleColor);
    double const width = style.extents(text, true, text.length(), true, &draw).x;
    TzGePoint3d const position =
        samplePosition(m_corners, frame(), flow(), m_nAttachment, m_dTextSize, width);
    drawSampleText(draw, text, position, m_vecNormal, m_vecX, style);
}
