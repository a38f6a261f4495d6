// Any text as markup, to rich text and back, twice in one session. Holds when a trip grows by no
// more than a font code a character.
#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "fuzz/markup/fuzz_session.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::wstring const text = markupfuzz::textOf(data, size);
    if (markupfuzz::mayExplodeAsMarkup(text)) return 0;
    markupfuzz::FreshConversions session;
    CStdStrW const once = session.roundTrip(text);
    if (once.size() > (size + 100) * (size + 100)) std::abort();
    if (!markupfuzz::isLookedAtTwice(size) || markupfuzz::mayExplodeAsMarkup(once)) return 0;
    CStdStrW const twice = session.roundTrip(once);
    if (twice.size() > (once.size() + 100) * (once.size() + 100)) std::abort();
    return 0;
}
