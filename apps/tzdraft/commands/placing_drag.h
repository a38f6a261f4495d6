#pragma once

#include <functional>
#include <vector>

#include "tz/db/entity.h"
#include "tz/db/object_id.h"
#include "tz/ed/jig.h"
#include "tz/ge/matrix3d.h"

// Drags that show entities of the drawing at other places, which they do not take yet.
//
//   PlacingDrag drag(ids, base, [](TzGePoint3d const& to) { return TzGeMatrix3d::...; });
//   if (drag.ask(localText(L"Second point")) == TzEdJig::kNormal) move(ids, drag.placed());
namespace tzdraft {

// The entities as they stand, drawn once for each matrix. Nothing is opened or copied.
class PlacedView final : public TzDbEntity {
public:
    explicit PlacedView(std::vector<TzDbObjectId> ids) : ids_(std::move(ids)) {}

    std::vector<TzGeMatrix3d> kept;  // shown whatever the cursor does
    TzGeMatrix3d moving;             // shown where the cursor leads

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;

private:
    void drawAt(TzGiWorldDraw& draw, TzGeMatrix3d const& placed) const;

    std::vector<TzDbObjectId> ids_;
};

class PlacingDrag final : public TzEdJig {
public:
    // What the cursor's place makes of the entities; all in world coordinates.
    using Placing = std::function<TzGeMatrix3d(TzGePoint3d const& cursor)>;

    PlacingDrag(std::vector<TzDbObjectId> ids, TzGePoint3d const& base, Placing placing);

    // Asks for one place: kNormal with a point; kNull after Enter; kString with an answer of
    // another kind, when `takesOthers`; anything else is a cancel.
    enum class Takes { points, otherAnswers };
    [[nodiscard]] DragStatus ask(wchar_t const* question, Takes takes = Takes::points);
    // The point that was answered last, in world coordinates.
    [[nodiscard]] TzGePoint3d const& cursor() const { return cursor_; }
    // Where it puts the entities.
    [[nodiscard]] TzGeMatrix3d const& placed() const { return view_.moving; }
    // Shows them there in the drags to come.
    void keep() { view_.kept.push_back(view_.moving); }
    [[nodiscard]] std::vector<TzGeMatrix3d> const& kept() const { return view_.kept; }

    DragStatus sampler() override { return acquirePoint(cursor_, base_); }
    bool update() override;
    [[nodiscard]] TzDbEntity* entity() const override { return &view_; }

private:
    mutable PlacedView view_;
    TzGePoint3d base_;
    TzGePoint3d cursor_;
    Placing placing_;
};

}  // namespace tzdraft
