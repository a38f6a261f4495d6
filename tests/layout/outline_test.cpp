#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

#include "host/layout/line_layout.h"
#include "host/layout/mtext_layout.h"
#include "host/shaping/shaper.h"
#include "host/shaping/text_outline.h"
#include "tests/layout/layout_printer.h"
#include "tz/text/string.h"

namespace {

using namespace tzhost;
using namespace tztest;

std::vector<OutlineStep> textOutline(GlyphRun const& run) {
    std::vector<OutlineStep> steps;
    outlineLetters(run, [&](OutlinedLetter const& letter) {
        steps.insert(steps.end(), letter.steps.begin(), letter.steps.end());
    });
    return steps;
}

LayoutBox inkOf(GlyphRun const& run) {
    LayoutBox ink{1e300, 1e300, -1e300, -1e300};
    for (OutlineStep const& step : textOutline(run)) {
        if (step.kind == OutlineKind::close) continue;
        int const count = step.kind == OutlineKind::curve ? 3 : 1;
        for (int i = 0; i < count; ++i) {
            LayoutPoint const& point = step.points[static_cast<std::size_t>(i)];
            ink.left = std::min(ink.left, point.x);
            ink.right = std::max(ink.right, point.x);
            ink.bottom = std::min(ink.bottom, point.y);
            ink.top = std::max(ink.top, point.y);
        }
    }
    return ink;
}

// The H of DejaVu Sans Mono reaches from 137 to 1096 of its 1233 units, and from 0 to 1493.
struct InkRow {
    char const* name;
    GlyphRun run;
    LayoutBox ink;
};

GlyphRun runOf(std::wstring const& text) {
    GlyphRun run;
    run.text = text;
    run.x = 100.0;
    run.y = 50.0;
    run.height = kCapital;
    run.face = {L"DejaVu Sans Mono", false, false};
    return run;
}

template <typename Change>
GlyphRun changed(std::wstring const& text, Change change) {
    GlyphRun run = runOf(text);
    change(run);
    return run;
}

TEST(Outline, LettersStandOnTheirRunsPlace) {
    double const slope = 0.5;
    InkRow const rows[] = {
        {"Plain", runOf(L"H"), {237, 50, 1196, 1543}},
        {"Two", runOf(L"HH"), {237, 50, 1233 + 1196, 1543}},
        {"Narrow",
         changed(L"HH", [](GlyphRun& run) { run.widthFactor = 0.5; }),
         {100 + 68.5, 50, 100 + (1233 + 1096) * 0.5, 1543}},
        {"Tracked",
         changed(L"HH", [](GlyphRun& run) { run.tracking = 2.0; }),
         {237, 50, 2466 + 1196, 1543}},
        {"Oblique",
         changed(L"H", [&](GlyphRun& run) { run.oblique = std::atan(slope); }),
         {237, 50, 1196 + slope * 1493, 1543}},
        {"Backward",
         changed(L"H", [](GlyphRun& run) { run.mirroredX = true; }),
         {100 - 1096, 50, 100 - 137, 1543}},
        {"UpsideDown",
         changed(L"H", [](GlyphRun& run) { run.mirroredY = true; }),
         {237, 50 - 1493, 1196, 50}},
        {"BlankAhead", runOf(L" H"), {1233 + 237, 50, 1233 + 1196, 1543}},
    };
    for (InkRow const& row : rows) {
        LayoutBox const ink = inkOf(row.run);
        EXPECT_NEAR(ink.left, row.ink.left, 0.01) << row.name;
        EXPECT_NEAR(ink.right, row.ink.right, 0.01) << row.name;
        EXPECT_NEAR(ink.bottom, row.ink.bottom, 0.01) << row.name;
        EXPECT_NEAR(ink.top, row.ink.top, 0.01) << row.name;
    }
}

// Drawn alone, a line that reads from the right has its last sign at its left end.
TEST(Outline, DirectionPlacesNeutralSigns) {
    LineLayoutInput input;
    input.textHeight = kCapital;
    input.style.typeface = L"DejaVu Sans Mono";
    input.text = L"\u05D0   ";
    GlyphRun const blanksBehind = layOutLine(input).runs.front();
    EXPECT_TRUE(blanksBehind.rightToLeft);
    EXPECT_GT(inkOf(blanksBehind).left, kLetter);
    input.text = L"a\u05D0";
    EXPECT_FALSE(layOutLine(input).runs.front().rightToLeft);
}

TEST(Outline, BlanksHaveNone) {
    EXPECT_TRUE(textOutline(runOf(L"  ")).empty());
}

std::size_t shapesOf(double tracking) {
    GlyphRun run;
    run.text = L"fi";
    run.face.typeface = L"DejaVu Sans";
    run.tracking = tracking;
    std::size_t letters = 0;
    outlineLetters(run, [&](OutlinedLetter const&) { ++letters; });
    return letters;
}

// f and i used to be one shape: tracking moved them as one letter, and down the page i had no place
// of its own.
TEST(Letters, DoNotJoinWhereEachHasItsPlace) {
    EXPECT_EQ(shapesOf(1), 1U);
    EXPECT_EQ(shapesOf(1.5), 2U);
    MTextLayoutInput input;
    input.contents = L"fi";
    input.style.typeface = L"@DejaVu Sans";
    MTextLayout const layout = layOutMText(input);
    ASSERT_EQ(layout.runs.size(), 2U);
    EXPECT_GT(layout.runs[1].advance, 0.0);
}

// Marks used to be drawn with the first face that had them, here a face of another script.
TEST(Letters, MarksTakeTheFaceOfTheLettersBesideThem) {
    struct {
        wchar_t const* text;
        std::size_t items;  // stretches that are drawn as one
    } const rows[] = {
        {L"\u56FE\u3001\u56FE", 1},
        {L"\u3010\u56FE", 1},
        {L"a\u3001\u3042\u56FE", 2},
        {L"\u3001", 1},
    };
    for (auto const& row : rows) {
        std::wstring const text = row.text;
        std::vector<ShapeSpan> const spans{{text.size(), {L"DejaVu Sans"}}};
        EXPECT_EQ(shapeText(text, spans, Ligatures::on).items.size(), row.items)
            << TzString(text).toUtf8();
    }
}

}  // namespace
