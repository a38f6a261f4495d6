#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

// The codes of fields: finding them in a text and computing what they stand for. A code runs from
// "%<" to the next ">%" and its word begins with a backslash.
namespace tzhost {

class Drawing;

// Where a code stands: its first character, and the one behind it.
struct FieldSpan {
    std::size_t first;
    std::size_t end;
};

// The first code at or behind `start`.
[[nodiscard]] std::optional<FieldSpan> findField(std::wstring_view text, std::size_t start);

// A text with its codes computed; those that cannot be show "####". Nothing is looked at twice: a
// value that looks like a code stays as it is. `drawing` may be null.
struct ExpandedText {
    std::wstring text;
    bool complete = true;  // every code could be computed
};
[[nodiscard]] ExpandedText expandFields(std::wstring_view text, Drawing const* drawing);

}  // namespace tzhost
