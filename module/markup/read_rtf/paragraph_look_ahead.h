#pragma once

#include <cstddef>
#include <set>
#include <vector>

#include "module/markup/shared/paragraph_settings.h"

// The indents and tabs of a paragraph whose settings begin at a place: those of all words from
// there to the next `\par`, or to the end of the text, whatever groups they stand in.
//
//   ParagraphLookAhead paragraphs;
//   ParagraphSettings settings = paragraphs.settingsFrom(cursor);   // places never go back
//
// What was looked through for one place serves every later one before the same `\par`, so that
// settings begun over and over do not look through the same text over and over.
class ParagraphLookAhead {
public:
    [[nodiscard]] ParagraphSettings settingsFrom(wchar_t const* start);

private:
    struct Value {
        wchar_t const* place = nullptr;
        int value = 0;
    };
    struct Tab {
        wchar_t const* place;
        int value;
        std::size_t next;  // the next tab of the same value
    };
    void lookThrough(wchar_t const* start);
    void linkTabs();
    void dropTabsAhead(wchar_t const* start);

    wchar_t const* end_ = nullptr;  // the `\par`, or the end of the text
    Value firstIndent_;
    Value leftIndent_;
    std::vector<Tab> tabs_;
    std::set<std::size_t> firstTabs_;  // the first of each value that is not yet passed
};
