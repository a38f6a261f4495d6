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

    // Puts a stop in its place. Nothing happens for one below 1, one that is there, and when there
    // are 32.
    void AddTab(int twips);
    [[nodiscard]] bool hasTabsOf(ParagraphSettings const& other) const;
};
