#include "host/selection/fence.h"

#include "host/base/job.h"
#include "host/command_line/point_input.h"
#include "host/database/user_system.h"
#include "host/selection/outline.h"
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
    EntityIds found;
    if (fence.size() < 2) return found;
    Job const job(localText(L"Selecting"));
    std::vector<TzGePoint2d> line;
    for (TzGePoint3d const& point : fence)
        line.push_back(point.convert2d());
    for (TzDbObjectId const id : entitiesOfActiveSpace()) {
        if (Outline::of(*entityOf(id)).meets(line)) found.append(id);
    }
    return found;
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
