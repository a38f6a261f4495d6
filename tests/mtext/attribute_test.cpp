// MTEXT on a text that somebody else holds: for an attribute definition and for an attribute's
// dialog.

#include <gtest/gtest.h>

#include "tests/mtext/held_text.h"
#include "tz/db/mtext.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"

namespace {

struct AttributeRow {
    char const* name;
    TzGePoint3d location;
    char const* script;
    int result;
    char const* shown;  // of the transcript
    TzGePoint3d locationAfter;
    wchar_t const* contents;
    double width;
};

void describe(TzDbMText& text, TzGePoint3d const& location) {
    text.setDatabaseDefaults();
    EXPECT_EQ(text.setTextHeight(2), Tzad::eOk);
    EXPECT_EQ(text.setLocation(location), Tzad::eOk);
    EXPECT_EQ(text.setWidth(7), Tzad::eOk);
    EXPECT_EQ(text.setAttachment(TzDbMText::kMiddleCenter), Tzad::eOk);
    EXPECT_EQ(text.setContents(L"before"), Tzad::eOk);
}

void expectText(TzDbMText const& text, AttributeRow const& row) {
    EXPECT_TRUE(text.location().isEqualTo(row.locationAfter));
    EXPECT_EQ(text.contents().str(), row.contents);
    EXPECT_DOUBLE_EQ(text.width(), row.width);
    EXPECT_EQ(text.database(), nullptr);
}

void expectTranscript(OpenDrawing const& drawing, char const* shown) {
    EXPECT_NE(TzString(drawing.transcript()).toUtf8().find(shown), std::string::npos)
        << TzString(drawing.transcript()).toUtf8();
}

AttributeRow const kDialogs[] = {
    {"AtTheOrigin", {}, "3,4\n<<<\nafter\n>>>\n", 1, "insertion point", {3, 4, 0}, L"after", 7},
    {"AtTheOriginCancelled", {}, "^C\n", 0, "insertion point", {}, L"before", 7},
    {"Elsewhere", {1, 2, 0}, "<<<\nafter\n>>>\n", 1, "", {1, 2, 0}, L"after", 7},
    {"EditorLeft", {1, 2, 0}, "<<<\nafter\n>>>cancel\n", 0, "", {1, 2, 0}, L"before", 7},
};

class AttributeDialogs : public testing::TestWithParam<AttributeRow> {};
TEST_P(AttributeDialogs, EditTheText) {
    AttributeRow const& row = GetParam();
    OpenDrawing const drawing(row.script);
    TzDbMText text;
    describe(text, row.location);
    TzDbObjectId const layer = text.layerId();
    EXPECT_EQ(doMTextCommandForAttributeDlg(&text), row.result);
    expectText(text, row);
    expectTranscript(drawing, row.shown);
    EXPECT_EQ(text.layerId(), layer);
    EXPECT_EQ(drawing.transcript().find(L"Current text style"), std::wstring::npos);
}
INSTANTIATE_TEST_SUITE_P(Rows, AttributeDialogs, testing::ValuesIn(kDialogs), [](auto const& row) {
    return row.param.name;
});

// The options alone are taken over; columns are no option, so the sixth keyword is the last.
AttributeRow const kDefinitions[] = {
    {"Dragged",
     {},
     "1,1\n41,-19\n",
     1,
     "[Height/Justify/Line spacing/Rotation/Style/Width]: ",
     {21, -9, 0},
     L"before",
     40},
    {"WidthTyped", {9, 9, 0}, "1,1\nW\n12\n", 1, "Specify width", {1, 1, 0}, L"before", 12},
    {"NoColumns", {9, 9, 0}, "1,1\nC\n^C\n", 0, "", {9, 9, 0}, L"before", 7},
    {"Cancelled", {9, 9, 0}, "1,1\n^C\n", 0, "", {9, 9, 0}, L"before", 7},
};

class AttributeDefinitions : public testing::TestWithParam<AttributeRow> {};
TEST_P(AttributeDefinitions, TakeTheOptions) {
    AttributeRow const& row = GetParam();
    OpenDrawing const drawing(row.script);
    TzDbMText text;
    describe(text, row.location);
    EXPECT_EQ(doMTextCommandForAttDefCmd(&text), row.result);
    expectText(text, row);
    expectTranscript(drawing, row.shown);
}
INSTANTIATE_TEST_SUITE_P(Rows,
                         AttributeDefinitions,
                         testing::ValuesIn(kDefinitions),
                         [](auto const& row) { return row.param.name; });

TEST(Attributes, WithoutATextDoNothing) {
    EXPECT_EQ(doMTextCommandForAttributeDlg(nullptr), 0);
    EXPECT_EQ(doMTextCommandForAttDefCmd(nullptr), 0);
    EXPECT_EQ(TzadEditMTextEntity(nullptr, kMTETabText, nullptr, 0, 0, true, true), 3);
}

// Reading adds the angle of the working globals, and writing does not take it away.
TEST(Options, ReadTheWorkingAngleAndNeverTakeItAway) {
    OpenDrawing const drawing;
    tzhost::DrawingSettings settings = tzhost::workingDrawing()->settings();
    settings.workingAngle = 0.25;
    tzhost::workingDrawing()->setSettings(settings);
    TzDbMText text;
    describe(text, {1, 2, 3});
    EXPECT_EQ(text.setRotation(0.5), Tzad::eOk);
    TzxMtextCommand command;
    command.setMTextOptionsFrom(&text);
    EXPECT_DOUBLE_EQ(command.rotation, 0.75);
    EXPECT_EQ(command.attachmentId, 1052U);
    command.setMTextOptionsTo(&text);
    EXPECT_NEAR(text.rotation(), 0.75, 1e-12);
}

}  // namespace
