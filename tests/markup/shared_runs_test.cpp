// The host's reader of the markup and the module's read one table of texts, so that they cannot
// drift apart. What a document does not keep is evened out first: numbers of colours, character
// sets, and whether a font was named by its file.

#include <gtest/gtest.h>

#include <cstdlib>

#include "tests/layout/markup_runs.h"
#include "tests/markup/conversions.h"
#include "tests/markup/rtf_runs.h"
#include "tz/gi/color.h"

namespace {

using namespace markuptest;
using namespace tzhost;

constexpr unsigned int kByLayer = 0x0000F1;
constexpr unsigned int kByBlock = 0x0000F2;
constexpr int kTwipsPerUnit = 10000;
constexpr DocumentScale kScale{kTwipsPerUnit / 10.0, kTwipsPerUnit * 0.72};
MarkupFormat const kInitial{0, 1.0, {}, false, false};

void evenOut(TextColor& color) {
    if (color.kind != TextColorKind::index) return;
    unsigned int const rgb = color.index == 256 ? kByLayer
                             : color.index == 0 ? kByBlock
                                                : tzedGetRGB(color.index);
    color = {TextColorKind::rgb, 256, rgb};
}

void evenOut(MarkupFont& font, CMTextFontMapDatabase& map) {
    if (font.byFile) {
        CMTextFontMapDatabase::MapType type{};
        Charset charset{};
        int pitch = 0;
        font.name = map.MapFileToFont(type, CStdStrW(font.name.c_str()), font.bold, font.italic,
                                      charset, pitch);
    }
    font.byFile = false;
    font.charset = font.pitchAndFamily = 0;
}

std::string evened(MarkupText read, CMTextFontMapDatabase& map) {
    for (MarkupFont& font : read.fonts)
        evenOut(font, map);
    for (MarkupFormat& format : read.formats)
        evenOut(format.color);
    return tztest::printRuns(read, kInitial);
}

MarkupText readByModule(std::wstring const& markup, CMTextFontMapDatabase& map) {
    CScaleCorrection fontScale(1);
    CScaleCorrection marginScale(0);
    for (CScaleCorrection* const scale : {&fontScale, &marginScale}) {
        scale->SetScaleUnits(1.0);
        scale->SetScaleTwips(kTwipsPerUnit);
    }
    CMTextToRichTextContext context(&map, &fontScale, &marginScale);
    context.SetInitialFontName(L"Initial", false, false, kAnsiCharset, 0);
    context.SetInitialFontSize(1.0, kTwipsPerUnit);
    context.SetInitialFontColor(0x123456);
    context.SetByLayerColor(kByLayer);
    context.SetByBlockColor(kByBlock);
    MarkupText read = readDocument(context.Parse(markup.c_str()).c_str(), kScale);
    read.tracking = context.GetTracking();
    read.widthFactor = context.GetCharWidth();
    read.oblique = context.GetOblique();
    return read;
}

TEST(SharedRuns, ReadAsTheHostReadsThem) {
    OwnFontMap const own;
    CMTextFontMapDatabase map(0);
    char const* const source = std::getenv("TZ_TEST_SOURCE");
    ASSERT_NE(source, nullptr);
    auto const cases = tztest::readRunsFile(std::string(source) + "/tests/layout/runs.txt");
    ASSERT_GT(cases.size(), 60U);
    for (tztest::RunsCase const& row : cases) {
        EXPECT_EQ(evened(readByModule(row.markup, map), map),
                  evened(readMarkup(row.markup, kInitial), map))
            << "runs.txt:" << row.line << ": " << row.name;
    }
}

}  // namespace
