// Any text as rich text. Holds when the result is the same for the same text, and grows by no more
// than a font code a character.
#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "fuzz/markup/fuzz_session.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::wstring const text = markupfuzz::textOf(data, size);
    if (markupfuzz::mayExplodeAsRtf(text)) return 0;
    CStdStrW const markup = markupfuzz::FreshConversions().toMtext(text);
    if (markup.size() > (size + 100) * (size + 100)) std::abort();
    if (!markupfuzz::isLookedAtTwice(size)) return 0;
    if (markupfuzz::FreshConversions().toMtext(text) != markup) std::abort();
    return 0;
}
