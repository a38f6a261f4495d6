// Lays out any text. The first four bytes choose width, attachment, columns and style. Holds when
// no character was made up, every line was placed, and the outlines of all runs can be drawn.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>

#include "host/layout/markup_reader.h"
#include "host/layout/mtext_layout.h"
#include "host/shaping/text_outline.h"
#include "host/text/utf8.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    constexpr std::size_t kOptions = 4;
    if (size < kOptions) return 0;
    tzhost::MTextLayoutInput input;
    input.width = data[0] / 8.0;
    input.attachment = data[1] % 10;
    input.columns.type = data[2] % 3;
    input.columns.count = data[2] / 8;
    input.columns.width = data[2] / 16.0;
    input.height = data[2] / 4.0;
    input.columns.autoHeight = data[2] % 2 != 0;
    input.lineSpacingStyle = 1 + data[3] % 2;
    input.style.vertical = data[3] % 4 >= 2;
    std::string const bytes(data + kOptions, data + size);
    input.contents = tzhost::fromUtf8(bytes);

    tzhost::MarkupText const read = tzhost::readMarkup(input.contents, {});
    if (read.text.size() > input.contents.size() || read.pieces.empty()) std::abort();
    tzhost::MTextLayout const layout = tzhost::layOutMText(input);
    if (layout.lines.empty()) std::abort();
    for (tzhost::GlyphRun const& run : layout.runs) {
        if (run.text.empty()) std::abort();
        tzhost::outlineLetters(run,
                               [](tzhost::OutlinedLetter const&) {});  // only that it ends counts
    }
    return 0;
}
