#include "host/display/plot_paint.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <limits>
#include <set>
#include <string>

#include "host/base/entity_drawing.h"
#include "host/display/plot_ink.h"
#include "tests/display/picture.h"

namespace {

using namespace tzhost;

constexpr double kNan = std::numeric_limits<double>::quiet_NaN();

DrawOp lines(int color, int fill, std::vector<TzGePoint3d> points) {
    DrawOp op;
    op.pen.color = TzCmEntityColor::fromIndex(color);
    op.pen.fill = fill;
    op.what = DrawnLines{std::move(points), fill != kFillNothing};
    return op;
}

DrawOp square(int color, int fill, double left, double bottom, double size) {
    double const right = left + size;
    double const top = bottom + size;
    return lines(color, fill,
                 {{left, bottom, 0}, {right, bottom, 0}, {right, top, 0}, {left, top, 0}});
}

DrawOp text(wchar_t const* string, double size) {
    DrawOp op;
    op.pen.color = TzCmEntityColor::fromIndex(7);
    DrawnText drawn{string, {}, TzGeVector3d::kZAxis, TzGeVector3d::kXAxis, {}, true};
    drawn.style.setTextSize(size);
    drawn.style.setFont(L"DejaVu Sans", false, false, 0, 0);
    op.what = drawn;
    return op;
}

std::string painted(PlotScene const& scene, PlotFormat format) {
    std::string bytes;
    ByteTaker const take = [&](std::string_view part) {
        bytes += part;
        return true;
    };
    std::set<std::string> lockedFaces;
    bool const good = paintPlot({fittedSheet(scene, format)}, format, take, lockedFaces);
    return good ? bytes : std::string();
}

Picture plotted(DrawList const& list, ViewAxes const& axes = ViewAxes()) {
    return Picture(painted(makeScene(list, axes), PlotFormat::png));
}

struct InkCase {
    char const* name;
    int color;
    int blockColor;
    int fill;
    PlotKind kind;
    int rgb;
};
// name, colour, the block's colour, fill type, kind of shape, 0xRRGGBB
constexpr InkCase kInks[] = {
    {"Index", 1, 256, kFillNothing, PlotKind::stroke, 0xFF0000},
    {"SevenIsBlack", 7, 256, kFillNothing, PlotKind::stroke, 0x000000},
    {"Grey", 9, 256, kFillNothing, PlotKind::stroke, 0xC0C0C0},
    {"ByLayerOfNone", 256, 256, kFillNothing, PlotKind::stroke, 0x000000},
    {"ByBlockOfNone", 0, 0, kFillNothing, PlotKind::stroke, 0x000000},
    {"ByBlock", 0, 3, kFillNothing, PlotKind::stroke, 0x00FF00},
    {"FilledWhiteStays", 7, 256, kFillColor, PlotKind::fill, 0xFFFFFF},
    {"FilledColor", 2, 256, kFillColor, PlotKind::fill, 0xFFFF00},
    {"PageHidesColor", 2, 256, kFillPage, PlotKind::fill, 0xFFFFFF},
    {"LettersOnAFill", 7, 256, kFillColor, PlotKind::stroke, 0x000000},
};
class Inks : public testing::TestWithParam<InkCase> {};
TEST_P(Inks, StandOutFromThePage) {
    auto const& row = GetParam();
    DrawPen pen;
    pen.color = TzCmEntityColor::fromIndex(row.color);
    pen.blockColor = TzCmEntityColor::fromIndex(row.blockColor);
    pen.fill = row.fill;
    PlotColor const ink = inkOf(pen, row.kind);
    long const rgb = std::lround(ink.red * 255) << 16 | std::lround(ink.green * 255) << 8 |
                     std::lround(ink.blue * 255);
    EXPECT_EQ(rgb, row.rgb);
    EXPECT_EQ(ink.alpha, 1.0);
}
INSTANTIATE_TEST_SUITE_P(Pens, Inks, testing::ValuesIn(kInks), [](auto const& row) {
    return row.param.name;
});

TEST(Plots, WhiteTrueColourIsBlackAndTransparencyShowsThrough) {
    DrawPen pen;
    pen.color = TzCmEntityColor(255, 255, 255);
    ASSERT_EQ(pen.transparency.setPercent(80), Tzad::eOk);
    EXPECT_EQ(inkOf(pen, PlotKind::stroke).red, 0.0);
    EXPECT_NEAR(inkOf(pen, PlotKind::stroke).alpha, 0.2, 0.005);
}

TEST(Plots, FillThePageToItsMargins) {
    // 810 of the 900 pixels in height: the margins are a twentieth of the smaller side.
    Picture const picture = plotted({square(1, kFillColor, 5e8, -3e8, 1e8)});
    ASSERT_EQ(picture.width(), 1600);
    ASSERT_EQ(picture.height(), 900);
    EXPECT_EQ(picture.count(0xFF0000), 810 * 810);
    EXPECT_EQ(picture.at(395, 45), 0xFF0000U);
    EXPECT_EQ(picture.at(394, 45), 0xFFFFFFU);
    EXPECT_EQ(picture.at(395, 44), 0xFFFFFFU);
}

TEST(Plots, PaintInTheOrderOfDrawing) {
    Picture const picture = plotted({square(1, kFillColor, 0, 0, 4), square(5, kFillColor, 0, 0, 2),
                                     square(3, kFillPage, 0, 0, 1)});
    // Up is up: the small squares stand at the bottom left.
    EXPECT_EQ(picture.at(420, 830), 0xFFFFFFU);
    EXPECT_EQ(picture.at(750, 500), 0x0000FFU);
    EXPECT_EQ(picture.at(750, 70), 0xFF0000U);
}

TEST(Plots, LookAlongTheView) {
    // A square on edge in plan is a square from the front.
    DrawOp wall = lines(1, kFillColor, {{0, 9, 0}, {4, 9, 0}, {4, 9, 4}, {0, 9, 4}});
    EXPECT_EQ(plotted({wall}, ViewAxes({0, -1, 0})).count(0xFF0000), 810 * 810);
    EXPECT_EQ(plotted({wall}).count(0xFF0000), 0);
}

TEST(Plots, DrawAsWideAsTheWeightSays) {
    DrawOp line = lines(1, kFillNothing, {{0, 0, 0}, {8, 0, 0}});
    auto const thickness = [&] {
        Picture const picture = plotted({line});
        int found = 0;
        for (int y = 0; y < picture.height(); ++y)
            found += picture.at(800, y) == 0xFF0000 ? 1 : 0;
        return found;
    };
    line.pen.lineWeight = 211;
    EXPECT_NEAR(thickness(), 8, 1);
    line.pen.lineWeight = -3;
    EXPECT_LE(thickness(), 1);
}

TEST(Plots, DashWhatIsNotTooFine) {
    PlotShape line;
    makeScene({lines(1, kFillNothing, {{0, 0, 0}, {10, 0, 0}})},
              ViewAxes())([&](PlotShape const& shape) { line = shape; });
    auto const inked = [&](std::vector<double> dashes) {
        line.dashes = std::move(dashes);
        line.lineWeight = 1.0;
        PlotScene const scene = [&](ShapeTaker const& take) { take(line); };
        return Picture(painted(scene, PlotFormat::png)).count(0xFF0000);
    };
    int const solid = inked({});
    EXPECT_LT(inked({0.5, 0.5}), solid * 2 / 3);
    EXPECT_GT(inked({0.5, 0.5}), solid / 3);
    EXPECT_EQ(inked({1e-6, 1e-6}), solid);
    EXPECT_EQ(inked({0.0, 0.0}), solid);
}

TEST(Plots, ShowLettersOfAnySizeAlike) {
    int const usual = plotted({text(L"Hxg", 1)}).count(0);
    EXPECT_GT(usual, 1000);
    EXPECT_NEAR(plotted({text(L"Hxg", 1e-6)}).count(0), usual, 20);
    EXPECT_NEAR(plotted({text(L"Hxg", 1e9)}).count(0), usual, 20);
}

// The box of one text of height 1 and some style, in hundredths: left, bottom, right, top.
std::string boxOf(void (*change)(DrawnText&)) {
    DrawOp op = text(L"HHHH", 1);
    change(std::get<DrawnText>(op.what));
    LayoutBox const box = extentsOf(makeScene({op}, ViewAxes())).value_or(LayoutBox{});
    auto const part = [](double value) { return std::to_string(std::lround(value * 10)) + ' '; };
    return part(box.left) + part(box.bottom) + part(box.right) + part(box.top);
}

TEST(Plots, PlaceTextsByTheirStyle) {
    EXPECT_EQ(boxOf([](DrawnText&) {}), "1 0 40 10 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.style.setXScale(2); }), "3 0 80 10 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.style.setObliquingAngle(std::atan(1.0)); }), "1 0 50 10 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.style.setBackward(true); }), "-40 0 -1 10 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.style.setUpsideDown(true); }), "1 -10 40 0 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.style.setVertical(true); }), "-4 -55 4 0 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.style.setFont(L"@DejaVu Sans", false, false, 0, 0); }),
              "1 0 40 10 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.direction = {0, 1, 0}; }), "-10 1 0 40 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.normal = {0, 0, -1}; }), "1 -10 40 0 ");
    EXPECT_EQ(boxOf([](DrawnText& t) { t.position = {7, 8, 9}; }), "71 80 110 90 ");
}

TEST(Plots, SurviveShapesOfNoUse) {
    DrawList const list = {lines(1, kFillNothing, {{kNan, 0, 0}, {1, 0, 0}}),
                           lines(1, kFillNothing, {{2, 2, 0}}),
                           lines(1, kFillNothing, {{1e300, 1e300, 0}, {-1e300, -1e300, 0}}),
                           text(L"", 1), text(L"edge", kNan)};
    for (PlotFormat const format : {PlotFormat::svg, PlotFormat::png, PlotFormat::pdf}) {
        EXPECT_FALSE(painted(makeScene(list, ViewAxes()), format).empty());
        EXPECT_FALSE(painted([](ShapeTaker const&) {}, format).empty());
    }
}

TEST(Plots, NeedNoFontsOfTheViewer) {
    PlotScene const scene = makeScene({text(L"Plan", 1)}, ViewAxes());
    std::string const svg = painted(scene, PlotFormat::svg);
    EXPECT_NE(svg.find("<path"), std::string::npos);
    EXPECT_EQ(svg.find("<text"), std::string::npos);
    EXPECT_EQ(svg.find("font"), std::string::npos);
    std::string const pdf = painted(scene, PlotFormat::pdf);
    EXPECT_EQ(pdf.substr(0, 5), "%PDF-");
    EXPECT_NE(pdf.find("/FontFile"), std::string::npos);
}

// Twelve letters with an outline, of seven kinds: A, n, a, the mark, g, o, the sign.
TEST(Plots, DefineAGlyphOnceAndTellTheWords) {
    DrawOp next = text(L"go<on", 1);
    std::get<DrawnText>(next.what).position = {0, 5, 0};
    std::string const svg =
        painted(makeScene({text(L"Anna & An", 1), next}, ViewAxes()), PlotFormat::svg);
    EXPECT_NE(svg.find("aria-label=\"Anna &amp; An\""), std::string::npos) << svg;
    EXPECT_NE(svg.find("aria-label=\"go&lt;on\""), std::string::npos) << svg;
    std::string_view const rest(svg);
    auto const count = [&](std::string_view part) {
        int found = 0;
        for (std::size_t at = 0; (at = rest.find(part, at)) != std::string_view::npos; ++at)
            ++found;
        return found;
    };
    EXPECT_EQ(count("<use "), 12);
    EXPECT_EQ(count("<path id="), 7);
}

// The names and dates that would differ between two runs are left out or told from outside.
TEST(Plots, OfOneSceneAreTheSameFile) {
    PlotScene const scene = makeScene({text(L"Plan", 1)}, ViewAxes());
    ASSERT_EQ(setenv("SOURCE_DATE_EPOCH", "86400", 1), 0);
    for (PlotFormat const format : {PlotFormat::svg, PlotFormat::png, PlotFormat::pdf}) {
        EXPECT_EQ(painted(scene, format), painted(scene, format));
    }
    EXPECT_NE(painted(scene, PlotFormat::pdf).find("(19700102000000Z)"), std::string::npos);
    unsetenv("SOURCE_DATE_EPOCH");
}

// Letters smaller than the grid of the page used to leave the page empty.
TEST(Plots, ShowTooSmallLettersAsALine) {
    EXPECT_GT(plotted({text(std::wstring(200'000, L'x').c_str(), 1)}).countShades(0), 500);
}

}  // namespace
