#pragma once

// Any rich text in the dialect that the module's reader takes: the same text, paragraphs, tabs,
// indents, fonts, sizes, colours, bold, italic, underline and strike-through.
//
//   NormalisedRtf const result = normaliseRtf(bytes);
//   read(fromUtf8(result.document));
//
// Nothing is an error: whatever comes in, time and memory are linear in it. List numbers stay as
// text, table rows become lines of cells with tabs between them, fields show their results.

#include <string>
#include <string_view>

#include "host/rtf/dialect_writer.h"

namespace tzhost {

struct NormalisedRtf {
    std::string document;  // UTF-8; ASCII but for characters above U+FFFF
    // What was left out.
    int pictures = 0;
    int notes = 0;
    int headers = 0;  // and footers

    [[nodiscard]] bool isComplete() const { return pictures + notes + headers == 0; }
};

// What stands in the place of the faces and colours of a document; here each stands for itself.
class RtfReplacements {
public:
    RtfReplacements() = default;
    RtfReplacements(RtfReplacements const&) = delete;
    RtfReplacements& operator=(RtfReplacements const&) = delete;
    virtual ~RtfReplacements() = default;
    // A face without a name is that of the text style.
    [[nodiscard]] virtual DialectFont font(DialectFont const& font) const { return font; }
    // 0x00BBGGRR.
    [[nodiscard]] virtual unsigned int color(unsigned int rgb) const { return rgb; }
};

// A byte above 0x7F is read in the code page of its run, which is the system's where the document
// names none.
[[nodiscard]] NormalisedRtf normaliseRtf(std::string_view bytes,
                                         RtfReplacements const& replacements = {});

}  // namespace tzhost
