#include "host/rtf/tab_lists.h"

#include <algorithm>

namespace tzhost {

int RtfTabLists::withStop(int list, int twips) {
    int const count = isList(list) ? nodeOf(list).count : 0;
    if (twips < 1 || count == kMostStops || hasStop(list, twips)) return list;
    int const before = isList(list) ? list : kEmpty;
    nodes_.push_back({before, twips, count + 1});
    return static_cast<int>(nodes_.size());
}

bool RtfTabLists::hasStop(int list, int twips) const {
    while (isList(list) && nodeOf(list).twips != twips)
        list = nodeOf(list).before;
    return isList(list);
}

std::vector<int> RtfTabLists::stopsOf(int list) const {
    std::vector<int> stops;
    for (; isList(list); list = nodeOf(list).before)
        stops.push_back(nodeOf(list).twips);
    std::reverse(stops.begin(), stops.end());
    return stops;
}

}  // namespace tzhost
