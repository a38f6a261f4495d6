#include "tests/markup/conversions.h"

#include <cstdlib>
#include <utility>

#include "host/fonts/font_map_path.h"

namespace markuptest {

OwnFontMap::OwnFontMap()
    : before_(tzhost::setFontMapFile(std::string(std::getenv("TZ_TEST_SOURCE")) +
                                     "/tests/markup/font_map.fmp")) {
    CMTextFontMapDatabase(0).ResetContents();
}

OwnFontMap::~OwnFontMap() {
    tzhost::setFontMapFile(before_);
    CMTextFontMapDatabase(0).ResetContents();
}

CStdStrW Conversions::roundTrip(std::wstring const& markup) {
    WrittenRtf const document = session_.toRtf(markup);
    WrittenMarkup trip = session_.toMarkup(document.rtf, document.found.wholeText);
    losses_ = std::move(trip.losses);
    return std::move(trip.markup);
}

TextStart startOfTests() {
    TextStart start;
    start.font = {L"Liberation Sans", false, false, kAnsiCharset, 34, {}};
    start.size = kSize;
    start.twips = kTwips;
    start.color = 0xFFFFFF;
    start.byLayer = 0x0000FF;
    start.byBlock = 0x00FF00;
    return start;
}

void setUp(CMTextToRichTextContext& context) {
    ::setUp(context, startOfTests());
}

void setUp(CRichTextToMTextContext& context) {
    ::setUp(context, startOfTests(), {});
}

std::wstring bodyOf(std::wstring const& document) {
    std::wstring const start = L"\\deftab0 ";
    std::wstring const end = L"\\par }";
    std::size_t const at = document.find(start);
    if (at == std::wstring::npos || document.size() < end.size() ||
        document.compare(document.size() - end.size(), end.size(), end) != 0) {
        return L"no document: " + document;
    }
    std::size_t const first = at + start.size();
    return document.substr(first, document.size() - end.size() - first);
}

std::string shown(std::wstring const& text) {
    return TzString(text).toUtf8();
}

}  // namespace markuptest
