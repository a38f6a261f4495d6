#include "host/entities/text_drawing.h"

#include "host/base/entity_drawing.h"
#include "host/entities/mtext_imp.h"
#include "host/layout/mtext_layout.h"
#include "tz/db/mtext.h"

namespace tzhost {
namespace {

// Gives the traits a run's colour and the entity's back at the end.
class PenColor {
public:
    explicit PenColor(TzGiSubEntityTraits& traits) : traits_(traits), entity_(traits.trueColor()) {}
    PenColor(PenColor const&) = delete;
    PenColor& operator=(PenColor const&) = delete;
    ~PenColor() { set({}); }

    void set(TextColor const& color) {
        if (color == now_) return;
        now_ = color;
        if (color.kind == TextColorKind::entity) {
            traits_.setTrueColor(entity_);
        } else if (color.kind == TextColorKind::index) {
            traits_.setColor(color.index);
        } else {
            auto const part = [&](unsigned int shift) {
                return static_cast<std::uint8_t>(color.rgb >> shift & 0xFFU);
            };
            traits_.setTrueColor({part(0), part(8), part(16)});
        }
    }

private:
    TzGiSubEntityTraits& traits_;
    TzCmEntityColor entity_;
    TextColor now_;
};

TzGiTextStyle styleOf(GlyphRun const& run) {
    TzGiTextStyle style;
    style.setFont(run.face.typeface, run.face.bold, run.face.italic, 0, 0);
    style.setTextSize(run.height);
    style.setXScale(run.widthFactor);
    style.setTrackingPercent(run.tracking);
    style.setObliquingAngle(run.oblique);
    style.setBackward(run.mirroredX);
    style.setUpsideDown(run.mirroredY);
    return style;
}

}  // namespace

TzGePoint3d TextFrame::at(LayoutPoint const& point) const {
    return origin + direction * point.x + normal.crossProduct(direction) * point.y;
}

void drawRuns(TzGiWorldDraw& draw, TextFrame const& frame, std::vector<GlyphRun> const& runs) {
    PenColor pen(draw.subEntityTraits());
    for (GlyphRun const& run : runs) {
        pen.set(run.color);
        draw.geometry().text(frame.at({run.x, run.y}), frame.normal, frame.direction,
                             run.text.c_str(), static_cast<int>(run.text.size()), true,
                             styleOf(run));
    }
}

void drawRules(TzGiWorldDraw& draw, TextFrame const& frame, std::vector<TextRule> const& rules) {
    PenColor pen(draw.subEntityTraits());
    for (TextRule const& rule : rules) {
        pen.set(rule.color);
        TzGePoint3d const points[] = {frame.at(rule.from), frame.at(rule.to)};
        draw.geometry().polyline(2, points, &frame.normal);
    }
}

}  // namespace tzhost

namespace {

void drawBackground(TzGiWorldDraw& draw,
                    tzhost::TextFrame const& frame,
                    tzhost::LayoutBox const& box,
                    tzhost::MTextBackground const& background) {
    TzGiSubEntityTraits& traits = draw.subEntityTraits();
    TzCmEntityColor const entityColor = traits.trueColor();
    traits.setTrueColor(background.color);
    traits.setTransparency(background.transparency);
    traits.setFillType(background.useBackgroundColor ? tzhost::kFillPage : tzhost::kFillColor);
    TzGePoint3d const corners[] = {frame.at({box.left, box.bottom}),
                                   frame.at({box.right, box.bottom}),
                                   frame.at({box.right, box.top}), frame.at({box.left, box.top})};
    draw.geometry().polygon(4, corners);
    traits.setFillType(tzhost::kFillNothing);
    traits.setTransparency(TzCmTransparency());
    traits.setTrueColor(entityColor);
}

}  // namespace

bool TzDbMText::subWorldDraw(TzGiWorldDraw* draw) {
    if (!draw || tzhost::takenWhole(draw, *this, L"MTEXT", location())) return true;
    auto const& values = tzhost::valuesOf<tzhost::MTextImp>(*this);
    auto const layout = values.layout();
    tzhost::TextFrame const frame{values.location, values.direction, values.normal};
    if (values.background && values.background->fill) {
        tzhost::LayoutBox const box =
            tzhost::backgroundBox(*layout, values.textHeight, values.background->scale);
        drawBackground(*draw, frame, box, *values.background);
    }
    tzhost::drawRuns(*draw, frame, layout->runs);
    tzhost::drawRules(*draw, frame, layout->rules);
    return true;
}
