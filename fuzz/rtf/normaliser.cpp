// Any bytes as rich text. Holds when the result is a document of the dialect in UTF-8 that grows by
// no more than a paragraph's settings a character. A second pass drops the fonts that no text uses,
// a third must change nothing. Characters above U+FFFF are left out of that: they stand bare, and a
// second pass takes them for bytes of a page.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "host/rtf/normaliser.h"
#include "host/text/utf8.h"

namespace {

constexpr std::size_t kMostGrowth = 600;

bool isAscii(std::string const& text) {
    for (char const c : text) {
        if (static_cast<signed char>(c) < 0) return false;
    }
    return true;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::string const bytes(data, data + size);
    std::string const document = tzhost::normaliseRtf(bytes).document;
    if (document.compare(0, 6, "{\\rtf1") != 0 || document.back() != '}') std::abort();
    if (tzhost::firstBadByte(document) != tzhost::kAllUtf8) std::abort();
    if (document.size() > (size + 1) * kMostGrowth) std::abort();
    if (!isAscii(document)) return 0;
    std::string const again = tzhost::normaliseRtf(document).document;
    if (tzhost::normaliseRtf(again).document != again) std::abort();
    return 0;
}
