#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

// The codes of fields: finding them in a text and computing what they stand for. A code runs from
// "%<" to the next ">%" and its word begins with a backslash.
namespace tzhost {

class Drawing;

// Where a code stands: its first character, and the first one after it.
struct FieldSpan {
    std::size_t first;
    std::size_t end;
};

// The first code that begins at `start` or after it.
[[nodiscard]] std::optional<FieldSpan> findField(std::wstring_view text, std::size_t start);
// The first code of a text of which only as much is read as finding it takes.
[[nodiscard]] std::optional<FieldSpan> findField(wchar_t const* text);

// A text with its codes computed; those that cannot be show "####". Nothing is looked at twice: a
// value that looks like a code stays as it is. The values of one text have no more than
// kMostFieldLetters together: fields that show each other's texts twice would fill any memory.
// `drawing` may be null.
inline constexpr std::size_t kMostFieldLetters = 100'000;
struct ExpandedText {
    std::wstring text;
    bool complete = true;  // every code could be computed
    bool tooLong = false;  // a value was left out for its length
};
[[nodiscard]] ExpandedText expandFields(std::wstring_view text, Drawing const* drawing);

}  // namespace tzhost
