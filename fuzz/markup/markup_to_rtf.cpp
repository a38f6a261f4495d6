// Any text as markup. Holds when the result is a document, and the same for the same text.
#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "fuzz/markup/fuzz_session.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::wstring const text = markupfuzz::textOf(data, size);
    CStdStrW const rtf = markupfuzz::FreshConversions().toRtf(text);
    if (rtf.compare(0, 6, L"{\\rtf1") != 0 || rtf.back() != L'}') std::abort();
    if (!markupfuzz::isLookedAtTwice(size)) return 0;
    if (markuptest::bodyOf(rtf).compare(0, 4, L"no d") == 0) std::abort();
    if (markupfuzz::FreshConversions().toRtf(text) != rtf) std::abort();
    return 0;
}
