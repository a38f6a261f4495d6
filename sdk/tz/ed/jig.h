#pragma once

#include "tz/export.h"
#include "tz/ge/point3d.h"
#include "tz/text/string.h"

class TzDbEntity;

// What one drag learned last, for reports on a command: whether a point was given, and which one,
// in world coordinates.
struct TzEdJigInputData {
    bool hasPoint = false;
    TzGePoint3d point;
};

// A drag. The host calls `sampler` for each place of the cursor; when it says kNormal the host
// calls `update` and draws `entity`. A drag begins with a sample where the cursor stands, drawn
// whatever its status. One object may be dragged again and again.
//
//   struct Rubber : TzEdJig {
//       DragStatus sampler() override { return acquirePoint(point_, base_); }
//       bool update() override { ... return true; }
//       TzDbEntity* entity() const override { return line_; }
//   };
//   rubber.setDispPrompt(L"Second point: ");
//   if (rubber.drag() == TzEdJig::kNormal) ...
//
// Points are world coordinates. The jig is the caller's and outlives the drag.
class TZ_API TzEdJig {
public:
    enum [[nodiscard]] DragStatus : int{
        kCancel = -4,    // the user cancelled
        kNoChange = -6,  // the sample equals the previous one; nothing is drawn
        kOther = -5,     // the host failed
        kString = -7,    // an answer of another kind, which tzedGetInput gives
        kNull = -1,      // an empty answer
        kNormal = 0,     // a point, or a sample that differs
        kKW1 = 1,        // the first keyword; the n-th gives n, up to 30
    };
    // Bits of the controls. kGovernedByOrthoMode lets ortho mode hold the point;
    // kAccept3dCoordinates keeps a third coordinate; with kAcceptOtherInputString an answer that is
    // no point ends the drag with kString. A drag accepts an empty answer whatever they say, and
    // the other bits are for hosts with a screen.
    enum UserInputControls : int {
        kGovernedByOrthoMode = 0x1,
        kNullResponseAccepted = 0x2,
        kDontEchoCancelForCtrlC = 0x4,
        kAcceptOtherInputString = 0x8,
        kNoNegativeResponseAccepted = 0x10,
        kNoZeroResponseAccepted = 0x20,
        kInitialBlankTerminatesInput = 0x40,
        kAccept3dCoordinates = 0x80,
        kAnyBlankTerminatesInput = 0x200,
        kGovernedByUCSDetect = 0x1000,
    };

    TzEdJig();
    TzEdJig(TzEdJig const&) = delete;
    TzEdJig& operator=(TzEdJig const&) = delete;
    virtual ~TzEdJig();

    // [command] Runs the drag to its decision.
    DragStatus drag();

    // Called by the host during drag(). Takes one sample, with acquirePoint.
    virtual DragStatus sampler() = 0;
    // Brings the entity to the sample's state; false keeps the picture as it is, with no redraw.
    virtual bool update() = 0;
    // The entity to draw; may be null. The jig keeps it.
    [[nodiscard]] virtual TzDbEntity* entity() const = 0;

    // During a drag [drag] or before it. The prompt is shown as it is; keywords have the form that
    // tzedInitGet takes.
    void setDispPrompt(wchar_t const* prompt);
    void setKeywordList(wchar_t const* keywords);
    [[nodiscard]] wchar_t const* keywordList() const;
    void setUserInputControls(UserInputControls controls);
    [[nodiscard]] UserInputControls userInputControls() const;
    // The cursor's form, for hosts with a screen: 2 rubber band, 8 drag box.
    void setSpecialCursorType(int type);

    // [drag] Where the cursor stands; with a base point the host may draw a line from it and ortho
    // mode, when the controls ask for it, holds the point on an axis through it. kNormal, or
    // kNoChange when the place is that of the sample before.
    DragStatus acquirePoint(TzGePoint3d& point);
    DragStatus acquirePoint(TzGePoint3d& point, TzGePoint3d const& base);

private:
    friend class TzEdJigDriver;
    friend TZ_API TzEdJigInputData const& tzedGetJigInputData(TzEdJig const& jig);

    class TzEdJigDriver* driver_ = nullptr;  // the drag in progress, the host's
    TzString prompt_;
    TzString keywords_;
    UserInputControls controls_{};
    int cursorType_ = 0;
    TzEdJigInputData data_;
};

// [any] What the jig's last drag learned; valid as long as the jig.
[[nodiscard]] TZ_API TzEdJigInputData const& tzedGetJigInputData(TzEdJig const& jig);
