#pragma once

// Texts of any size for both converters: plain ones, dense ones and those that a careless converter
// would read over and over.

#include <cstddef>
#include <span>
#include <string>

#include "module/markup/session/conversion_session.h"

namespace tzbench {

enum class Way { toRtf, toMtext };

// What a text is like: plain, with a change of the look every 40 characters, or made of entries of
// a table.
enum class Sort { plain, dense, entries, growing, other };

// A text is the head, the unit again and again, and the tail. A "#" in the unit is its number,
// counted from `first`.
struct TextKind {
    char const* name;
    Sort sort;
    Way way;
    std::wstring head;
    std::wstring unit;
    std::wstring tail;
    long first = 0;
    // Beyond 100,000 entries a sweep takes minutes, and beyond as many toggles of a long name the
    // result takes all memory.
    std::size_t mostSize = sort == Sort::entries || sort == Sort::growing ? 4000000 : 50000000;
};

[[nodiscard]] std::span<TextKind const> textKinds();

// The text of that many characters, or a unit more.
[[nodiscard]] std::wstring textOf(TextKind const& kind, std::size_t size);

// How the texts start.
[[nodiscard]] TextStart startOfTexts();

// Converted in a session that may have seen other texts.
[[nodiscard]] std::wstring converted(ConversionSession& session, Way way, std::wstring const& text);

}  // namespace tzbench
