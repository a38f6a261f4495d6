#include "host/selection/selection_mode.h"

#include <string_view>

namespace tzhost {

namespace {

struct WayRow {
    wchar_t letter;
    SelectionWay way;
};

constexpr WayRow kWays[] = {
    {L'I', SelectionWay::implied},  {L'X', SelectionWay::all},    {L'L', SelectionWay::last},
    {L'P', SelectionWay::previous}, {L'W', SelectionWay::window}, {L'C', SelectionWay::crossing},
};

// The letter after a colon; false for an unknown one. `c` and `p` change nothing.
bool takeOption(wchar_t letter, SelectionMode& mode) {
    switch (letter) {
    case L'$': mode.hasPrompts = true; return true;
    case L'K': mode.wordsGoToCallback = true; return true;
    case L'L':
    case L'l': mode.leavesOutLocked = true; return true;
    case L'c':
    case L'p': return true;
    default: return false;
    }
}

bool takeWay(wchar_t letter, SelectionMode& mode) {
    if (letter == L'_') return true;
    for (WayRow const& row : kWays) {
        if (row.letter != letter) continue;
        mode.way = row.way;
        return true;
    }
    return false;
}

}  // namespace

std::optional<SelectionMode> SelectionMode::parse(wchar_t const* text) {
    SelectionMode mode;
    std::wstring_view rest(text ? text : L"");
    while (!rest.empty()) {
        bool const isOption = rest.front() == L':' && rest.size() > 1;
        bool const isTaken = isOption ? takeOption(rest[1], mode) : takeWay(rest.front(), mode);
        if (!isTaken) return std::nullopt;
        rest.remove_prefix(isOption ? 2 : 1);
    }
    return mode;
}

}  // namespace tzhost
