// Where the dialog's window stands. The drawing area lies at 160,90 and is 1600 by 900 pixels; a
// VIEWSIZE of 10 makes 90 pixels of a unit, and the world's origin is the pixel 960,540.

#include <gtest/gtest.h>

#include <cmath>
#include <numbers>

#include "module/edit/editor_placement.h"
#include "module/edit/field_backslashes.h"
#include "tests/mtext/held_text.h"
#include "tz/mte/globals.h"

namespace {

struct PlacementRow {
    char const* name;
    double x, y, rotation, textHeight;
    TzScreenPoint point;
    TzScreenRect rect;
    int points;
    int isAsDrawn;
};
constexpr double kQuarter = std::numbers::pi / 2;
constexpr PlacementRow kPlacementRows[] = {
    // 9 pixels of text: 9 + 1 points; the window takes its least size, 100 by 16.
    {"Level", 0, 0, 0, 0.1, {954, 534}, {954, 534, 1054, 550}, 10, 1},
    {"TooSmallToRead", 0, 0, 0, 0.05, {954, 534}, {954, 534, 1054, 550}, 5, 0},
    // Corners one above the other: 300 by 40 stand in.
    {"Upright", 0, 0, kQuarter, 0.1, {954, 534}, {954, 534, 1254, 574}, 16, 0},
    {"NearTheTop", 0, 5.5, 0, 0.1, {954, 100}, {954, 100, 1054, 116}, 10, 0},
    {"LeftOfTheDesktop", -12, 0, 0, 0.1, {50, 534}, {50, 534, 150, 550}, 10, 0},
    {"RightEdge", 10.6, 0, 0, 0.1, {1908, 534}, {1819, 534, 1919, 550}, 10, 0},
    {"AtTheCorner", -96.0 / 9, 6, 0, 0.1, {960, 540}, {960, 540, 1060, 556}, 10, 0},
    {"NotOnAnyScreen", 1e300, 0, 0, 0.1, {960, 540}, {960, 540, 1260, 580}, 16, 0},
};

void place(TzDbMText& text, PlacementRow const& row) {
    text.setDatabaseDefaults();
    EXPECT_EQ(text.setContents(L"lll"), Tzad::eOk);
    EXPECT_EQ(text.setLocation({row.x, row.y, 0}), Tzad::eOk);
    EXPECT_EQ(text.setRotation(row.rotation), Tzad::eOk);
    EXPECT_EQ(text.setTextHeight(row.textHeight), Tzad::eOk);
}

TEST(Placement, FollowsTheTextOnTheScreen) {
    OpenDrawing const drawing;
    for (PlacementRow const& row : kPlacementRows) {
        SCOPED_TRACE(row.name);
        EasyObject<TzDbMText> text(new TzDbMText, EasyFlags::kDelete);
        place(*text.object, row);
        CalcEditorSizeAndPosition(text);
        EXPECT_EQ(gcPoint.x, row.point.x);
        EXPECT_EQ(gcPoint.y, row.point.y);
        EXPECT_EQ(gcRect.left, row.rect.left);
        EXPECT_EQ(gcRect.top, row.rect.top);
        EXPECT_EQ(gcRect.right, row.rect.right);
        EXPECT_EQ(gcRect.bottom, row.rect.bottom);
        EXPECT_EQ(giPoints, row.points);
        EXPECT_EQ(gwysiwyg, row.isAsDrawn);
        EXPECT_EQ(gdx, row.x);
    }
}

// An empty text is as high as a line: the height of the box dragged before it does not show, and is
// set back all the same.
TEST(Placement, UsesTheDraggedBoxUp) {
    OpenDrawing const drawing;
    EasyObject<TzDbMText> text(new TzDbMText, EasyFlags::kDelete);
    text->setDatabaseDefaults();
    gdJigBoundBoxHeight = 3.0;
    g_dMTextObjectHeight = 5.0;
    FixedEditorSizeAndPosition(text);
    EXPECT_EQ(g_dMTextObjectHeight, 5.0);
    EXPECT_EQ(gdJigBoundBoxHeight, 3.0);
    EXPECT_EQ(gcPoint.x, 960);
    EXPECT_EQ(gcRect.right, 300);
    CalcEditorSizeAndPosition(text);
    EXPECT_EQ(g_dMTextObjectHeight, 0.0);
    EXPECT_EQ(gdJigBoundBoxHeight, 0.0);
}

struct BackslashRow {
    wchar_t const* plain;
    wchar_t const* doubled;
};
constexpr BackslashRow kBackslashRows[] = {
    {L"a\\Pb", L"a\\Pb"},
    {L"\\L%<\\Date>%\\l", L"\\L%<\\\\Date>%\\l"},
    {L"%<\\Var A>%\\P%<\\Object 2A\\\\x>%", L"%<\\\\Var A>%\\P%<\\\\Object 2A\\\\\\\\x>%"},
    {L"open %<\\Date", L"open %<\\Date"},
};
TEST(FieldBackslashes, AreDoubledInsideFieldsAlone) {
    for (BackslashRow const& row : kBackslashRows) {
        CStdStrW text = row.plain;
        convertBackslashesInFields(text, 7);
        EXPECT_EQ(text, row.doubled);
        convertBackslashesInFields(text, kHalveBackslashes);
        EXPECT_EQ(text, row.plain);
    }
}

}  // namespace
