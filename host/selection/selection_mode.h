#pragma once

#include <optional>

// How a selection is made, as the mode text of tzedSSGet says it.
namespace tzhost {

enum class SelectionWay { ask, implied, all, last, previous, window, crossing };

struct SelectionMode {
    SelectionWay way = SelectionWay::ask;
    bool hasPrompts = false;         // the second argument is a pair of prompts
    bool wordsGoToCallback = false;  // and the question goes on
    bool leavesOutLocked = false;    // entities on locked layers

    // Null is an empty text. Nothing for a text with an unknown letter.
    [[nodiscard]] static std::optional<SelectionMode> parse(wchar_t const* text);
};

}  // namespace tzhost
