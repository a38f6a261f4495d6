// Any text as markup, to rich text and back, twice in one session. Holds when a trip grows by no
// more than a font code a character.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "tests/markup/conversions.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    TzString const text = TzString::fromUtf8(
        std::string_view(reinterpret_cast<char const*>(data), size));  // bytes as UTF-8
    markuptest::Session session;
    CStdStrW const once = session.roundTrip(text.str());
    if (once.size() > (size + 100) * (size + 100)) std::abort();
    if (size > 4096) return 0;  // a font's name may come back at every character
    CStdStrW const twice = session.roundTrip(once);
    if (twice.size() > (once.size() + 100) * (once.size() + 100)) std::abort();
    return 0;
}
