#pragma once

// The styles of a document by number. A style has the numbers of looks and paragraphs that its
// entry sets, and those of the style that it is based on where it sets none.

#include <array>
#include <unordered_map>

#include "host/rtf/state.h"

namespace tzhost {

using RtfStyleValues = std::array<int, kRtfStyleFields>;

// Paragraph and character styles are numbered each for themselves.
enum class RtfStyleKind { paragraph, character };

class RtfStyleSheet {
public:
    // Replaces a style of that number. `basedOn` may be a style that is defined later, or never.
    void define(RtfStyleKind kind, int number, int basedOn, RtfStyleValues const& values);

    // All unset for a number that no style has.
    [[nodiscard]] RtfStyleValues valuesOf(RtfStyleKind kind, int number) const;

private:
    struct Style {
        int basedOn;
        RtfStyleValues values;
    };
    using Styles = std::unordered_map<int, Style>;
    std::array<Styles, 2> styles_;
};

}  // namespace tzhost
