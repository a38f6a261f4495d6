// Any text as rich text. Holds when the result is the same for the same text, and grows by no more
// than a font code a character.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "tests/markup/conversions.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    TzString const text = TzString::fromUtf8(
        std::string_view(reinterpret_cast<char const*>(data), size));  // bytes as UTF-8
    markuptest::Session first;
    CStdStrW const markup = first.toMtext(text.str());
    if (markup.size() > (size + 100) * (size + 100)) std::abort();
    markuptest::Session second;
    if (second.toMtext(text.str()) != markup) std::abort();
    return 0;
}
