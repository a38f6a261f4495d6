#include "tests/markup/conversions.h"

#include <cstdlib>

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

Conversions::Conversions() {
    for (CScaleCorrection* scale : {&fontScale_, &marginScale_}) {
        scale->SetScaleUnits(kSize);
        scale->SetScaleTwips(kTwips);
    }
}

CStdStrW Conversions::toRtf(std::wstring const& markup) {
    CMTextToRichTextContext context(&fonts_, &fontScale_, &marginScale_);
    setUp(context);
    return context.Parse(markup.c_str());
}

CStdStrW Conversions::toMtext(std::wstring const& rtf) {
    CRichTextToMTextContext context(&fonts_, &fontScale_, &marginScale_);
    setUp(context);
    return context.Parse(rtf.c_str());
}

CStdStrW Conversions::roundTrip(std::wstring const& markup) {
    CMTextToRichTextContext there(&fonts_, &fontScale_, &marginScale_);
    setUp(there);
    CStdStrW const rtf = there.Parse(markup.c_str());
    CRichTextToMTextContext back(&fonts_, &fontScale_, &marginScale_);
    setUp(back);
    back.SetTracking(there.GetTracking());
    back.SetCharWidth(there.GetCharWidth());
    back.SetOblique(there.GetOblique());
    back.SetBaseAlignment(there.GetBaseAlignment(), 0);
    return back.Parse(rtf.c_str());
}

void setUp(CMTextToRichTextContext& context) {
    context.SetInitialFontName(L"Liberation Sans", false, false, kAnsiCharset, 34);
    context.SetInitialFontSize(kSize, kTwips);
    context.SetInitialFontColor(0xFFFFFF);
    context.SetByLayerColor(0x0000FF);
    context.SetByBlockColor(0x00FF00);
}

void setUp(CRichTextToMTextContext& context) {
    context.SetInitialFontName(L"Liberation Sans", false, false, kAnsiCharset, 34);
    context.SetInitialFontSize(kSize, kTwips);
    context.SetByLayerColor(0x0000FF);
    context.SetByBlockColor(0x00FF00);
    context.SetInitialColor(0xFFFFFF);
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
