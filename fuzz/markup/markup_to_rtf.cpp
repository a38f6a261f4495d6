// Any text as markup. Holds when the result is a document, and the same for the same text.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "tests/markup/conversions.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    TzString const text = TzString::fromUtf8(
        std::string_view(reinterpret_cast<char const*>(data), size));  // bytes as UTF-8
    markuptest::Session first;
    CStdStrW const rtf = first.toRtf(text.str());
    if (rtf.compare(0, 6, L"{\\rtf1") != 0 || rtf.back() != L'}') std::abort();
    if (markuptest::bodyOf(rtf).compare(0, 4, L"no d") == 0) std::abort();
    markuptest::Session second;
    if (second.toRtf(text.str()) != rtf) std::abort();
    return 0;
}
