#pragma once

#include <optional>
#include <string>

#include "host/page/page.h"

// Where a drawing lies on its page.
//
//   if (auto const problem = problemOf(page)) say(*problem);
//   PagePlan const plan = planOf(page, extents);
//   // a point of the drawing lies at sheet middle + (point - plan.middle) * plan.scale
namespace tzhost {

// A page's width and height as it lies.
struct SheetSize {
    double width;
    double height;
};
[[nodiscard]] SheetSize sheetOf(Page const& page);

struct PagePlan {
    double scale = 1.0;  // millimetres on paper for a drawing unit
    double middleX = 0.0;
    double middleY = 0.0;
    // The part of the drawing that the page shows: the window, as far as it lies within the
    // margins.
    PageBox shown;
    // Whether something of the drawing lies beyond it.
    bool leavesOut = false;
};

// `window` is the page's own as the drawing is looked at, nothing for all of it; `extents` is the
// box around all that is drawn.
[[nodiscard]] PagePlan
planOf(Page const& page, std::optional<PageBox> const& window, PageBox const& extents);

// Whether the margins leave something of the paper.
[[nodiscard]] bool hasRoom(Page const& page);

// What makes a page useless: margins that leave nothing of the paper, or a scale beyond all
// numbers. A text in the language of the session.
[[nodiscard]] std::optional<std::string> problemOf(Page const& page);

}  // namespace tzhost
