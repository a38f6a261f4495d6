#pragma once

#include "module/prompt/jig_entity.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

// The preview before the first corner of a text is chosen: the sample text in the current text
// style, beside the cursor. It draws no lines.
//
//   CTzsMtextFirstPointJig jig(TzGePoint3d::kOrigin);
//   CTzsJigInput input(controls, keywords, &jig, prompt);
//   input.Prompt();
//   TzGePoint3d const corner = jig.cursor();
//
// World coordinates and drawing units. The axes are those of the active space and are read again
// with every move, so the text follows a change of the user system.
class CTzsMtextFirstPointJig : public CTzsJigEntity {
public:
    // The point is not used: the text appears where the cursor is.
    explicit CTzsMtextFirstPointJig(TzGePoint3d const&);

    // Takes the axes of the active space and the rotation that the current style asks for.
    void updateVectors();
    // Turns the text, radians, until the next move.
    void SetRotation(double radians);
    // Where the text stands; the origin before the first move.
    [[nodiscard]] TzGePoint3d const& cursor() const { return m_ptCursor; }

    TzEdJig::DragStatus OnSample(TzEdJig& jig) override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;

private:
    TzGeVector3d m_vecUcsX;
    TzGeVector3d m_vecUcsY;
    TzGeVector3d m_vecNormal;
    TzGeVector3d m_vecX;  // the axes turned by the rotation
    TzGeVector3d m_vecY;
    TzGePoint3d m_ptCursor;
    double m_dRotation = 0;
    double m_dTextSize = 0;
    bool m_bFirstSample = true;
    bool m_bHidden = false;
    bool m_bVertical = false;
};
