#include "host/page/page.h"

#include <utility>

namespace tzhost {

bool PageChoice::isEmpty() const {
    return !paper && !landscape && !margin && !scale && !unit && !window && !dotsPerInch;
}

std::optional<Page> pageOf(std::optional<Page> const& own, PageChoice const& choice) {
    if (choice.isEmpty()) return own;
    Page page = own.value_or(Page());
    page.paper = choice.paper.value_or(page.paper);
    page.landscape = choice.landscape.value_or(page.landscape);
    if (choice.landscape) page.paper = turned(page.paper, *choice.landscape);
    page.margin = choice.margin.value_or(page.margin);
    page.scale = choice.scale.value_or(page.scale);
    page.unit = choice.unit.value_or(page.unit);
    if (choice.window) page.window = choice.window;
    return page;
}

Paper turned(Paper const& paper, bool landscape) {
    Paper result = paper;
    bool const isOtherwise = landscape ? paper.width < paper.height : paper.width > paper.height;
    if (paper.name == PaperName::custom && isOtherwise) std::swap(result.width, result.height);
    return result;
}

}  // namespace tzhost
