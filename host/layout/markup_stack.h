#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "host/layout/markup_reader.h"

// The stacked texts of the markup: telling them from text that only looks like one, and splitting
// them.
namespace tzhost::markup {

// Tells whether the arguments of a stack code hold a stack character. Without one the code is text,
// and what follows is read again, so the probe remembers what it has walked over in vain: all calls
// together walk in linear time, provided that positions never go back to before a stack that was
// found.
class StackProbe {
public:
    // `contents` must outlive this object.
    explicit StackProbe(std::wstring const& contents) : contents_(contents) {}

    // Whether the arguments that begin at `position` hold a stack character.
    [[nodiscard]] bool holdsMark(std::size_t position);

private:
    std::wstring const& contents_;
    std::vector<std::uint32_t> seen_;  // by position, a bit for each state of the walk
};

// The two parts of a stack. `split` is false when no bare stack character divides the text; all of
// it is then the upper part.
struct StackParts {
    std::wstring upper;
    std::wstring lower;
    StackKind kind = StackKind::over;
    bool split = false;
};

// Splits the arguments of a stack at the first bare "/", "#" or "^". An escaped one is a part's
// text.
[[nodiscard]] StackParts splitStack(std::wstring const& arguments);

}  // namespace tzhost::markup
