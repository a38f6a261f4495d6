#pragma once

// What the fuzzers of the converters share: a session that costs little to set up, and the inputs
// that are left out.

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include "tests/markup/conversions.h"

namespace markupfuzz {

// Puts the suite's font map in force for the rest of the process.
class KeptFontMap {
public:
    KeptFontMap();
};

// Conversions as at the start of the process: scales and proxies go with each session. The rest of
// the font map is read once and stays.
class FreshConversions : private KeptFontMap, public markuptest::Conversions {};

// The bytes as UTF-8, up to the first zero, where a text ends for the converters.
[[nodiscard]] std::wstring textOf(std::uint8_t const* data, std::size_t size);

// Whether an input of this size is one of those that get a second look. It costs as much as the
// first and seldom finds more.
[[nodiscard]] bool isLookedAtTwice(std::size_t size);

// Whether the names of fonts may come back so often in the result that it fills the memory. Markup
// names a font in each code, a document in its table.
[[nodiscard]] bool mayExplodeAsMarkup(std::wstring_view markup);
[[nodiscard]] bool mayExplodeAsRtf(std::wstring_view rtf);

}  // namespace markupfuzz
