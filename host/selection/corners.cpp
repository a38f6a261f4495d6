#include "host/selection/corners.h"

#include "host/command_line/point_input.h"
#include "host/database/user_system.h"
#include "host/selection/rubber_line.h"
#include "host/text/local_text.h"
#include "tz/ed/jig.h"
#include "tz/ed/prompts.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

// From a corner in user coordinates to the cursor.
class BoxDrag final : public TzEdJig {
public:
    explicit BoxDrag(TzGePoint3d const& first)
        : toWorld_(currentUserSystem().matrix()), first_(first) {
        setDispPrompt(localText(L"Opposite corner: "));
        setUserInputControls(kAccept3dCoordinates);
        setSpecialCursorType(kRubberBand);
    }

    DragStatus sampler() override { return acquirePoint(cursor_, toWorld_ * first_); }
    bool update() override;
    [[nodiscard]] TzDbEntity* entity() const override { return &view_; }

private:
    TzGeMatrix3d toWorld_;
    TzGePoint3d first_;
    TzGePoint3d cursor_;  // world coordinates
    mutable RubberLine view_;
};

bool BoxDrag::update() {
    TzGePoint3d const other = toWorld_.inverse() * cursor_;
    double const z = first_.z;
    view_.points = {
        first_, {other.x, first_.y, z}, {other.x, other.y, z}, {first_.x, other.y, z}, first_};
    for (TzGePoint3d& each : view_.points)
        each.transformBy(toWorld_);
    return true;
}

}  // namespace

std::optional<AskedBox> askBox() {
    double at[3] = {};
    int const asked = tzedGetPoint(nullptr, localText(L"First corner: "), at);
    if (asked == Tzad::ePromptNone) return AskedBox();
    if (asked != Tzad::ePromptNormal) return std::nullopt;
    TzGePoint3d const first(at[0], at[1], at[2]);
    int const dragged = BoxDrag(first).drag();
    if (dragged == TzEdJig::kNull) return AskedBox();
    if (dragged != TzEdJig::kNormal) return std::nullopt;
    return AskedBox{FlatBox::between(first.convert2d(), lastPoint().convert2d())};
}

}  // namespace tzhost
