#include "apps/tzdraft/commands/placing_drag.h"

#include <utility>

#include "host/display/record_access.h"
#include "tz/gi/draw.h"

namespace tzdraft {

void PlacedView::drawAt(TzGiWorldDraw& draw, TzGeMatrix3d const& placed) const {
    draw.geometry().pushModelTransform(placed);
    for (TzDbObjectId const id : ids_)
        (void)draw.geometry().draw(tzhost::objectOf<TzDbEntity>(id));
    draw.geometry().popModelTransform();
}

bool PlacedView::subWorldDraw(TzGiWorldDraw* draw) {
    if (!draw) return true;
    for (TzGeMatrix3d const& each : kept)
        drawAt(*draw, each);
    drawAt(*draw, moving);
    return true;
}

PlacingDrag::PlacingDrag(std::vector<TzDbObjectId> ids, TzGePoint3d const& base, Placing placing)
    : view_(std::move(ids)), base_(base), cursor_(base), placing_(std::move(placing)) {}

TzEdJig::DragStatus PlacingDrag::ask(wchar_t const* question, Takes takes) {
    int controls = kGovernedByOrthoMode | kAccept3dCoordinates;
    if (takes == Takes::otherAnswers) controls |= kAcceptOtherInputString;
    setUserInputControls(static_cast<UserInputControls>(controls));
    setDispPrompt(TzString::formatted(L"\n%ls: ", question));
    return drag();
}

bool PlacingDrag::update() {
    view_.moving = placing_(cursor_);
    return true;
}

}  // namespace tzdraft
