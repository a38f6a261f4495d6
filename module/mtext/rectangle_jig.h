#pragma once

#include "module/mtext/box_geometry.h"
#include "module/prompt/jig_entity.h"
#include "tz/db/object_id.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

// The preview while the second corner of a text is chosen: the text box in the user system, an
// arrow on each edge past which the text can grow, and a sample of text at the attachment point.
//
//   CTzsMtextJig jig(firstCorner);
//   jig.SetAttachment(TzDbMText::kMiddleCenter);
//   CTzsJigInput input(controls, keywords, &jig, prompt);
//   if (input.Prompt() == Tzad::ePromptNormal) width = jig.Width();
//
// World coordinates, drawing units, radians. It may be dragged again and again.
class CTzsMtextJig : public CTzsJigEntity {
public:
    explicit CTzsMtextJig(TzGePoint3d const& first);

    // Turns the box's frame and stretches the box to its bottom right corner anew. After a drag up
    // or to the left that corner may be the first one; the box then has no size until the next
    // move.
    void SetRotation(double radians);
    // 1 to 9; with any other neither top nor bottom is drawn, and the box counts as attached at its
    // first corner.
    void SetAttachment(int attachment) { m_nAttachment = attachment; }
    void SetTextSize(double size) { m_dTextSize = size; }
    // Drags the second corner to a point.
    void SetStretchPoint(TzGePoint3d const& point);

    // Along the lines of the text, and across them.
    [[nodiscard]] double Width() const;
    [[nodiscard]] double Height() const;
    // Where a text with this attachment is to be placed.
    void GetJigAttachPoint(TzGePoint3d& out) const;

    // The line type of the box: the drawing's first one, when it is solid, else the null id.
    [[nodiscard]] static TzDbObjectId GetSolidLine();
    static void DrawLine(TzGiWorldDraw* draw, TzGePoint3d const& a, TzGePoint3d const& b);
    // Draws the arrow on the inner side of an edge, unless the box is too small for it. `flip`
    // turns the arrow round, for the edge at the bottom.
    void
    DrawArrow(TzGiWorldDraw* draw, TzGePoint3d const& a, TzGePoint3d const& b, bool flip) const;
    void DrawOpenTop(TzGiWorldDraw* draw) const;
    void DrawClosedTop(TzGiWorldDraw* draw) const;
    void DrawOpenBottom(TzGiWorldDraw* draw) const;
    void DrawClosedBottom(TzGiWorldDraw* draw) const;

    TzEdJig::DragStatus OnSample(TzEdJig& jig) override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;

private:
    [[nodiscard]] UserAxes frame() const { return {m_vecX, m_vecY, m_vecNormal}; }
    [[nodiscard]] LineFlow flow() const;
    void drawSample(TzGiWorldDraw& draw) const;

    TzDbObjectId m_solidLine;
    BoxCorners m_corners;
    TzGeVector3d m_vecUcsX;
    TzGeVector3d m_vecUcsY;
    TzGeVector3d m_vecNormal;
    TzGeVector3d m_vecX;  // the axes turned by the rotation
    TzGeVector3d m_vecY;
    TzGeVector3d m_vecWidth;  // along the turned axes, as long as the box's edges
    TzGeVector3d m_vecHeight;
    int m_nAttachment = 1;
    double m_dRotation = 0;
    double m_dArrowSize = 0;
    double m_dTextSize = 0;
    TzGePoint3d m_ptLastSample;
    bool m_bFirstSample = true;
    bool m_bVertical = false;
};
