#include "host/selection/fence.h"

#include <algorithm>

#include "host/command_line/point_input.h"
#include "host/database/user_system.h"
#include "host/selection/entities_where.h"
#include "host/selection/rubber_line.h"
#include "host/text/local_text.h"
#include "tz/ed/jig.h"
#include "tz/ed/prompts.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

constexpr int kUndo = TzEdJig::kKW1;

// From a fence that has points to the cursor.
class FenceDrag final : public TzEdJig {
public:
    explicit FenceDrag(FencePoints const& fence) {
        TzGeMatrix3d const toWorld = currentUserSystem().matrix();
        for (TzGePoint3d const& point : fence)
            view_.points.push_back(toWorld * point);
        view_.points.push_back(view_.points.back());
        TzString const undo = localText(L"Undo");
        setKeywordList(undo == L"Undo" ? undo : undo + L" _Undo");
        setDispPrompt(TzString::formatted(localText(L"Next fence point, or Enter to end [%ls]: "),
                                          undo.kwszPtr()));
        setUserInputControls(
            static_cast<UserInputControls>(kGovernedByOrthoMode | kAccept3dCoordinates));
        setSpecialCursorType(kRubberBand);
    }

    DragStatus sampler() override {
        return acquirePoint(view_.points.back(), view_.points[view_.points.size() - 2]);
    }
    bool update() override { return true; }
    [[nodiscard]] TzDbEntity* entity() const override { return &view_; }

private:
    mutable RubberLine view_;
};

// What the question for the next point, the first one too, ended with.
int askPoint(FencePoints& fence) {
    if (!fence.empty()) {
        int const status = FenceDrag(fence).drag();
        if (status == TzEdJig::kNormal) fence.push_back(lastPoint());
        return status;
    }
    double at[3] = {};
    int const status = tzedGetPoint(nullptr, localText(L"First fence point: "), at);
    if (status == Tzad::ePromptNone) return TzEdJig::kNull;
    if (status != Tzad::ePromptNormal) return TzEdJig::kCancel;
    fence.emplace_back(at[0], at[1], at[2]);
    return TzEdJig::kNormal;
}

}  // namespace

EntityIds entitiesAcross(FencePoints const& fence) {
    if (fence.size() < 2) return EntityIds();
    std::vector<TzGePoint2d> line;
    FlatBox around{fence.front().convert2d(), fence.front().convert2d()};
    for (TzGePoint3d const& point : fence) {
        line.push_back(point.convert2d());
        around.low = {std::min(around.low.x, point.x), std::min(around.low.y, point.y)};
        around.high = {std::max(around.high.x, point.x), std::max(around.high.y, point.y)};
    }
    return entitiesWhere(around, [&](Outline const& outline) { return outline.meets(line); });
}

std::optional<FencePoints> askFence() {
    FencePoints fence;
    for (;;) {
        switch (askPoint(fence)) {
        case TzEdJig::kNormal: break;
        case TzEdJig::kNull: return fence;
        case kUndo:
            fence.pop_back();
            if (!fence.empty()) setLastPoint(fence.back());  // "@" counts from the end of the line
            break;
        default: return std::nullopt;
        }
    }
}

}  // namespace tzhost
