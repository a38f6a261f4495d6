#include "module/markup/read_rtf/paragraph_look_ahead.h"

#include <cwchar>
#include <limits>
#include <unordered_map>

#include "module/markup/read_rtf/rtf_tokens.h"

namespace {

constexpr std::size_t kNone = std::numeric_limits<std::size_t>::max();

}  // namespace

ParagraphSettings ParagraphLookAhead::settingsFrom(wchar_t const* start) {
    if (!end_ || start > end_) lookThrough(start);
    dropTabsAhead(start);
    ParagraphSettings settings;
    if (firstIndent_.place && firstIndent_.place >= start)
        settings.firstIndent = firstIndent_.value;
    if (leftIndent_.place && leftIndent_.place >= start) settings.leftIndent = leftIndent_.value;
    for (std::size_t const tab : firstTabs_) {
        if (settings.tabCount == ParagraphSettings::kMostTabs) break;
        settings.AddTab(tabs_[tab].value);
    }
    return settings;
}

// No word ends in a backslash, so every backslash opens one, wherever the search began. Also the
// second of an escaped pair does: the "par" of `\\par` ends the paragraph here.
void ParagraphLookAhead::lookThrough(wchar_t const* start) {
    firstIndent_ = leftIndent_ = {};
    tabs_.clear();
    firstTabs_.clear();
    wchar_t const* place = std::wcschr(start, L'\\');
    for (; place; place = std::wcschr(place, L'\\')) {
        wchar_t const* const word = place;
        int value = 0;
        std::wstring_view const name = readControlWord(++place, value);
        if (name == L"par") {
            end_ = word;
            break;
        }
        if (name == L"fi") firstIndent_ = {word, value};
        if (name == L"li") leftIndent_ = {word, value};
        if (name == L"tx" && value >= 1) tabs_.push_back({word, value, kNone});
    }
    if (!place) end_ = start + std::wcslen(start);
    linkTabs();
}

void ParagraphLookAhead::linkTabs() {
    if (tabs_.empty()) return;
    std::unordered_map<int, std::size_t> next;
    for (std::size_t i = tabs_.size(); i-- > 0;) {
        auto const [at, isNew] = next.try_emplace(tabs_[i].value, i);
        if (isNew) continue;
        tabs_[i].next = at->second;
        at->second = i;
    }
    for (auto const& first : next)
        firstTabs_.insert(first.second);
}

void ParagraphLookAhead::dropTabsAhead(wchar_t const* start) {
    while (!firstTabs_.empty() && tabs_[*firstTabs_.begin()].place < start) {
        std::size_t const next = tabs_[*firstTabs_.begin()].next;
        firstTabs_.erase(firstTabs_.begin());
        if (next != kNone) firstTabs_.insert(next);
    }
}
