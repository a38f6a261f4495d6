#include "module/edit/editor_placement.h"

#include <algorithm>
#include <climits>
#include <cmath>

#include "module/host_calls/sys_var.h"
#include "module/host_calls/truncate.h"
#include "tz/ed/view.h"
#include "tz/mte/globals.h"
#include "tz/pal/windows_calls.h"

namespace {

constexpr int kPointsAtFirst = 16;
constexpr int kFixedWidth = 300;
// The window's frame stands this far outside the text.
constexpr int kFrame = 6;
// A text nearer to the desktop's edge than the first of each pair leaves no room for the frame and
// the caption; the window then moves to the second.
constexpr int kLeastTop = 106;
constexpr int kTopInstead = 100;
constexpr int kLeastLeft = 6;
constexpr int kLeftInstead = 50;
// Stand in for the box of a text whose first two corners lie one above the other on the screen.
constexpr double kWidthInstead = 300.0;
constexpr double kHeightInstead = 40.0;
// Smaller letters cannot be edited at their place.
constexpr int kLeastPoints = 7;
// Limits of the window, in pixels and as a part of the desktop.
constexpr double kLeastWidth = 100.0;
constexpr double kLeastHeight = 16.0;
constexpr double kMostOfDesktop = 0.85;
constexpr int kDesktopEdge = 1;

// Corners of a text in the order in which it gives them.
constexpr int kTopLeft = 0;
constexpr int kTopRight = 1;
constexpr int kBottomLeft = 2;
constexpr int kCorners = 4;

RECT windowRect(HWND window) {
    RECT rect{};
    GetWindowRect(window, &rect);
    return rect;
}

TzScreenPoint centreOf(RECT const& rect) {
    return {rect.left + (rect.right - rect.left) / 2, rect.top + (rect.bottom - rect.top) / 2};
}

// The origin for a point that the screen cannot show.
POINT onScreen(int viewport, TzGePoint3d const& world) {
    POINT pixel{};
    if (tzedCoordFromWorldToPixel(viewport, world, pixel))
        ClientToScreen(GetDrawingAreaWindow(), &pixel);
    return pixel;
}

bool isInside(RECT const& rect, POINT const& point) {
    return point.x >= rect.left && point.x <= rect.right && point.y >= rect.top &&
           point.y <= rect.bottom;
}

double distance(POINT const& a, POINT const& b) {
    return std::hypot(static_cast<double>(b.x) - a.x, static_cast<double>(b.y) - a.y);
}

void placePoint(POINT const& mapped, RECT const& desktop) {
    gcPoint = {mapped.x - kFrame, mapped.y - kFrame};
    if (mapped.x == 0 && mapped.y == 0) {
        gcPoint = centreOf(desktop);
        gwysiwyg = 0;
        return;
    }
    if (mapped.y < kLeastTop) {
        gcPoint.y = kTopInstead;
        gwysiwyg = 0;
    }
    if (mapped.x < kLeastLeft) {
        gcPoint.x = kLeftInstead;
        gwysiwyg = 0;
    }
}

// The text's box on the screen; a factor of 0 means that it has no direction there.
struct ScreenBox {
    double factor = 0.0;  // of the slope: the cosine of its angle
    double width = kWidthInstead;
    double height = kHeightInstead;
};

ScreenBox screenBox(POINT const (&corners)[kCorners]) {
    POINT const& first = corners[kTopLeft];
    POINT const& second = corners[kTopRight];
    if (first.x == second.x) {
        gwysiwyg = 0;
        return {};
    }
    double const slope =
        (static_cast<double>(second.y) - first.y) / (static_cast<double>(second.x) - first.x);
    if (slope != 0.0) gwysiwyg = 0;
    return {std::cos(std::atan(slope)), distance(first, second),
            distance(first, corners[kBottomLeft])};
}

void setPoints(double textHeight, double factor) {
    giPoints = kPointsAtFirst;
    if (factor != 0.0) {
        RECT const area = windowRect(GetDrawingAreaWindow());
        double const pixels =
            textHeight * (area.bottom - area.top) / CTzadSysVar::GetDouble(L"VIEWSIZE");
        giPoints = truncatedToInt(std::min(pixels / factor, INT_MAX - 1.0)) + 1;
    }
    if (giPoints < kLeastPoints) gwysiwyg = 0;
}

// Where a side of the given length begins so that it stays inside the desktop, moved no farther
// than that takes.
int insideDesktop(int begin, int length, int low, int high) {
    return std::max(std::min(begin, high - kDesktopEdge - length), low + kDesktopEdge);
}

void setRect(ScreenBox const& box, RECT const& desktop) {
    double const mostWidth = kMostOfDesktop * (desktop.right - desktop.left);
    double const mostHeight = kMostOfDesktop * (desktop.bottom - desktop.top);
    int const width = truncatedToInt(std::min(std::max(box.width, kLeastWidth), mostWidth));
    int const height = truncatedToInt(std::min(std::max(box.height, kLeastHeight), mostHeight));
    int const left = insideDesktop(gcPoint.x, width, desktop.left, desktop.right);
    int const top = insideDesktop(gcPoint.y, height, desktop.top, desktop.bottom);
    gcRect = {left, top, left + width, top + height};
}

double heightOf(TzArray<TzGePoint3d> const& corners) {
    return corners.length() == kCorners ? corners[kTopLeft].distanceTo(corners[kBottomLeft]) : 0.0;
}

}  // namespace

bool PartIsOffScreen() {
    return true;
}

void CalcEditorSizeAndPosition(EasyObject<TzDbMText>& text) {
    int const viewport = CTzadSysVar::GetInt(L"CVPORT");
    TzArray<TzGePoint3d> corners;
    text->getBoundingPoints(corners);
    RECT const desktop = windowRect(GetDesktopWindow());
    double const height = heightOf(corners);
    corners.setLogicalLength(kCorners);  // a text without corners stands at the origin
    gdx = corners[kTopLeft].x;
    gdy = corners[kTopLeft].y;
    g_dMTextObjectHeight = height == 0.0 ? gdJigBoundBoxHeight : 0.0;
    gdJigBoundBoxHeight = 0.0;
    gwysiwyg = 1;

    POINT mapped[kCorners];
    for (int i = 0; i < kCorners; ++i)
        mapped[i] = onScreen(viewport, corners[i]);
    placePoint(mapped[kTopLeft], desktop);
    bool const areInside = std::all_of(mapped + kTopRight, mapped + kCorners,
                                       [&](POINT const& p) { return isInside(desktop, p); });
    if (!areInside) gwysiwyg = 0;
    ScreenBox const box = screenBox(mapped);
    setPoints(text->textHeight(), box.factor);
    setRect(box, desktop);
}

void FixedEditorSizeAndPosition(EasyObject<TzDbMText>& text) {
    gcPoint = centreOf(windowRect(GetApplicationWindow()));
    gwysiwyg = 0;
    giPoints = kPointsAtFirst;
    gcRect = {0, 0, kFixedWidth, 0};
    if (!text.object) return;
    TzArray<TzGePoint3d> corners;
    text->getBoundingPoints(corners);
    if (heightOf(corners) == 0.0) g_dMTextObjectHeight = gdJigBoundBoxHeight;
}
