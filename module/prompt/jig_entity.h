#pragma once

#include "tz/db/entity.h"
#include "tz/ed/jig.h"
#include "tz/text/string.h"

// What a dragged question shows, and how it reaches the host. A preview derives from CTzsJigEntity:
//
//   class Rubber : public CTzsJigEntity {
//       TzEdJig::DragStatus OnSample(TzEdJig& jig) override;   // asks the jig for the cursor
//       bool subWorldDraw(TzGiWorldDraw* draw) override;       // draws what was sampled
//   };
//
// and is dragged by a CTzsJigInput of module/prompt/jig_input.h. It lies on the stack of whoever
// asks, made before the input, and is never added to a drawing. Points are world coordinates.
class CTzsJigEntity : public TzDbEntity {
public:
    // What the host draws: the preview itself.
    [[nodiscard]] virtual TzDbEntity* GetJigEntity();
    // Takes a sample of the cursor. The body in this class returns that nothing changed.
    [[nodiscard]] virtual TzEdJig::DragStatus OnSample(TzEdJig& jig) = 0;
    // Called when a sample changed something; true to be drawn.
    [[nodiscard]] virtual bool OnUpdate(TzEdJig& jig);

    // A point for the derived class to keep, from which its drag starts; the origin at first.
    void SetBasePoint(TzGePoint3d const& point);
    void SetBasePoint(double const (&point)[3]);
    [[nodiscard]] TzGePoint3d GetBasePoint() const;

private:
    double basePoint[3] = {0, 0, 0};
};

// The host's side of the drag: passes everything on to the preview.
class CTzsJigHandler : public TzEdJig {
public:
    // Gives the preview the working drawing's defaults. It is not owned and outlives the handler.
    CTzsJigHandler(CTzsJigEntity* preview, UserInputControls inputControls);

    // The keywords of the drag, as tzedInitGet takes them; empty for none.
    void setSampledKeywords(TzString const& list) { keywordList_ = list; }

    DragStatus sampler() override;
    bool update() override;
    [[nodiscard]] TzDbEntity* entity() const override;

private:
    CTzsJigEntity* entity_;
    UserInputControls controls_;
    TzString keywordList_;
};
