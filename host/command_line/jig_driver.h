#pragma once

// The host's side of one drag: where the cursor stands, what the jig is asked, and what is drawn.
//
// A drag begins with a sample where the cursor stands, which is drawn even when the jig saw no
// change. A pick at a place where the cursor has not been is a sample there first. The cursor's
// place lives on from drag to drag, in world coordinates; answers give it in user coordinates. A
// sample looks at nothing of the drawing but its user system and ortho mode.

#include <optional>
#include <string_view>

#include "host/command_line/question.h"
#include "tz/ed/jig.h"

namespace tzhost {

// Puts the cursor back to the origin, where it stands when the process starts.
void resetDragCursor();

}  // namespace tzhost

class TzEdJigDriver {
public:
    // Takes the jig's calls to acquirePoint until it ends.
    explicit TzEdJigDriver(TzEdJig& jig);
    ~TzEdJigDriver();
    TzEdJigDriver(TzEdJigDriver const&) = delete;
    TzEdJigDriver& operator=(TzEdJigDriver const&) = delete;

    [[nodiscard]] TzEdJig::DragStatus run();
    // Where the cursor stands; null without a base point.
    [[nodiscard]] TzEdJig::DragStatus acquire(TzGePoint3d& point, TzGePoint3d const* base);

private:
    [[nodiscard]] int sample();
    [[nodiscard]] int ask();
    [[nodiscard]] tzhost::Reply take(std::wstring_view answer);
    [[nodiscard]] tzhost::Reply moveTo(TzGePoint3d const& user);
    [[nodiscard]] tzhost::Reply pick(TzGePoint3d const& user);
    [[nodiscard]] bool has(TzEdJig::UserInputControls control) const;
    void redraw() const;

    TzEdJig& jig_;
    TzEdJigDriver* outer_;  // of the same jig, when a drag runs inside its own sampler
    std::optional<TzGePoint3d> lastSample_;  // what acquire gave last
    bool isStale_ = false;                   // the last sample changed the picture
};
