#include "apps/tzconvert/conversion.h"

#include <utility>

#include "module/markup/shared/rtf_units.h"
#include "tz/text/string.h"

namespace tzconvert {
namespace {

CStdStrW wide(std::string const& text) {
    return CStdStrW(TzString::fromUtf8(text));
}

TextStart startOf(Options const& options) {
    TextStart start;
    start.font = {wide(options.face), options.bold,
                  options.italic,     static_cast<Charset>(options.charset),
                  options.pitch,      wide(options.fontFile)};
    start.size = options.size;
    start.twips = options.twips;
    start.color = options.color;
    start.byLayer = options.byLayer.value_or(kUnsetColor);
    if (options.byBlock) start.byBlock = colorBeside(*options.byBlock, start.byLayer);
    return start;
}

// What is known before any conversion.
MarkupFindings startFindings(Options const& options) {
    MarkupFindings found;
    found.wholeText = {options.tracking, options.widthFactor, options.oblique,
                       static_cast<VerticalAlignment>(options.baseAlignment)};
    int const halfPoints = options.twips / kTwipsPerHalfPoint;
    found.minFontSize = found.maxFontSize = halfPoints;
    found.initialFontSize = found.currentFontSize = halfPoints;
    return found;
}

}  // namespace

Converted convert(Options const& options, FontTables& fonts, std::wstring text) {
    fonts.prepare();
    ConversionSession session(startOf(options));
    MarkupFindings found = startFindings(options);
    RtfLosses losses;
    if (options.direction != Direction::toMtext) {
        WrittenRtf document = session.toRtf(text);
        text = std::move(document.rtf);
        found = document.found;
    }
    if (options.direction != Direction::toRtf) {
        unsigned int const keeps = CRichTextToMTextContext::kKeepTrailingParagraphs;
        WrittenMarkup markup =
            session.toMarkup(text, found.wholeText, options.keepsTrailingParagraphs ? keeps : 0U);
        text = std::move(markup.markup);
        found.stacksSeen = found.stacksSeen || markup.stacksSeen;
        losses = std::move(markup.losses);
    }
    return {std::move(text), found, std::move(losses)};
}

}  // namespace tzconvert
