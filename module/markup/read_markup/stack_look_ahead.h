#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

// Whether the text after a `\S` is a stack, and where it ends.
//
// A `\S` without a sign of a stack is read again as plain text, so each of a row of them would look
// through everything after it. Once that has cost more than the text is long, the answers for all
// places are worked out in one pass from the end.
//
//   StackLookAhead stacks(text);
//   if (stacks.isStack(text + 2)) ...
class StackLookAhead {
public:
    // The text must outlive this object.
    explicit StackLookAhead(wchar_t const* text) : text_(text) {}

    // Whether a text that begins there, up to its ";" or the end, holds a sign of a stack.
    [[nodiscard]] bool isStack(wchar_t const* start);

private:
    using Place = std::uint32_t;

    [[nodiscard]] bool search(std::size_t start);
    void workOutAll();

    std::wstring_view text_;
    std::size_t spent_ = 0;     // characters looked at in vain
    std::vector<Place> ends_;   // empty until they are worth it
    std::vector<Place> signs_;  // the first sign at or after each place
};

// The text of a stack as rich text: `\U+XXXX` in the form of rich text, all else as it stands, also
// a character that rich text would escape. Ends at a zero.
[[nodiscard]] std::wstring rebuiltStack(std::wstring_view text);
