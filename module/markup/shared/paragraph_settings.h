#pragma once

#include <array>

// Indents and tab stops of a paragraph, in twips.
struct ParagraphSettings {
    static constexpr int kMostTabs = 32;

    int firstIndent = 0;
    int leftIndent = 0;
    int tabCount = 0;
    std::array<int, kMostTabs> tabs{};  // ascending
    bool isSet = false;

    // Adds a stop in ascending order. A stop below 1, one that is already there, and any after 32
    // are ignored.
    void AddTab(int twips);
    [[nodiscard]] bool hasTabsOf(ParagraphSettings const& other) const;
};
