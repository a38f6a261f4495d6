#include "module/markup/shared/paragraph_settings.h"

#include <algorithm>

void ParagraphSettings::AddTab(int twips) {
    if (twips < 1 || tabCount == kMostTabs) return;
    auto const end = tabs.begin() + tabCount;
    auto const at = std::lower_bound(tabs.begin(), end, twips);
    if (at != end && *at == twips) return;
    std::move_backward(at, end, end + 1);
    *at = twips;
    ++tabCount;
}

bool ParagraphSettings::hasTabsOf(ParagraphSettings const& other) const {
    return std::equal(tabs.begin(), tabs.begin() + tabCount, other.tabs.begin(),
                      other.tabs.begin() + other.tabCount);
}
