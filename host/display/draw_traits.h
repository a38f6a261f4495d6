#pragma once

#include "host/display/draw_list.h"
#include "tz/gi/draw.h"

// The traits of a drawing in progress: they only keep what is set, in a pen.
namespace tzhost {

class DrawTraits : public TzGiDrawableTraits {
public:
    [[nodiscard]] DrawPen const& pen() const { return pen_; }
    void setPen(DrawPen const& pen) { pen_ = pen; }

    // An index outside 0 to 256 changes nothing.
    void setColor(int index) override;
    void setTrueColor(TzCmEntityColor const& color) override { pen_.color = color; }
    [[nodiscard]] int color() const override { return pen_.color.colorIndex(); }
    [[nodiscard]] TzCmEntityColor trueColor() const override { return pen_.color; }
    void setLineType(TzDbObjectId linetype) override { pen_.linetype = linetype; }
    void setLineWeight(int weight) override { pen_.lineWeight = weight; }
    void setLayer(TzDbObjectId layer) override { pen_.layer = layer; }
    void setFillType(int fill) override { pen_.fill = fill; }
    void setTransparency(TzCmTransparency const& transparency) override {
        pen_.transparency = transparency;
    }

private:
    DrawPen pen_;
};

}  // namespace tzhost
