#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "host/selection/entity_list.h"
#include "host/selection/outline.h"

// What an answer at a selection prompt means.
namespace tzhost {

enum class Touch { within, crossing };

// The entities of the active space in a window, or those that it touches.
[[nodiscard]] EntityIds entitiesIn(FlatBox const& box, Touch touch);

struct SelectionAnswer {
    enum class Kind {
        entities,   // these
        add,        // what follows is added
        remove,     // what follows is taken out
        cancelled,  // so is the selection, at a question for a point
    };
    Kind kind = Kind::entities;
    EntityIds ids;
};

// Handles with blanks between them, each taken once; "w" or "c" with two points or "f" with more of
// them, which are asked for when the word stands alone; "all", "last", "previous", "add", "remove";
// or one point, which takes the newest entity whose box holds it. Words count without case, their
// first letters and a leading "_" too. Points become the last point. Nothing for any other text,
// and for handles of what is not in the active space.
[[nodiscard]] std::optional<SelectionAnswer> readSelection(std::wstring_view text);

// The first handle of a line of handles that names nothing in the active space; empty for none.
[[nodiscard]] std::wstring missingHandle(std::wstring_view text);

// The words in the language of the session, as a user is told them: "window, crossing, ...".
[[nodiscard]] std::wstring selectionWords();

}  // namespace tzhost
