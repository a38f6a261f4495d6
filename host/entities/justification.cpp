#include "host/entities/justification.h"

#include <utility>

#include "host/layout/line_layout.h"

namespace tzhost {

namespace {

// Parts of the way across the box, and up from its foot.
struct AnchorRow {
    double across;
    double up;
};

// In the order of the justifications. A box stands on the baseline, so the first three are at its
// foot.
constexpr AnchorRow kAnchors[TzDbText::kJustifications] = {
    {0, 0},   {0.5, 0},   {1, 0},    // left, center, right
    {0, 1},   {0.5, 1},   {1, 1},    // top
    {0, 0.5}, {0.5, 0.5}, {1, 0.5},  // middle
    {0, 0},   {0.5, 0},   {1, 0},    // bottom
};

}  // namespace

LayoutPoint
anchorOf(LayoutBox const& box, LayoutStyle const& style, TzDbText::Justification justification) {
    LayoutBox unturned = box;
    if (style.backward) std::swap(unturned.left, unturned.right);
    if (style.upsideDown) std::swap(unturned.bottom, unturned.top);
    auto const [across, up] = kAnchors[justification];
    if (isVerticalStyle(style) && justification <= TzDbText::kRight)
        return {0, unturned.top - unturned.height() * across};
    return {unturned.left + unturned.width() * across, unturned.bottom + unturned.height() * up};
}

}  // namespace tzhost
