// A text stays where it is on the page when another point of its box becomes the attached one.

#include "module/edit/attachment.h"

#include <gtest/gtest.h>

#include "tests/mtext/held_text.h"

namespace {

void describe(TzDbMText& text, TzDbMText::AttachmentPoint attachment, double width) {
    text.setDatabaseDefaults();
    EXPECT_EQ(text.setNormal({0, -1, 0}), Tzad::eOk);
    EXPECT_EQ(text.setDirection({0.6, 0, 0.8}), Tzad::eOk);
    EXPECT_EQ(text.setLocation({3, 4, 5}), Tzad::eOk);
    EXPECT_EQ(text.setTextHeight(2), Tzad::eOk);
    EXPECT_EQ(text.setWidth(width), Tzad::eOk);
    EXPECT_EQ(text.setContents(L"One\\PTwo and three"), Tzad::eOk);
    EXPECT_EQ(text.setAttachment(attachment), Tzad::eOk);
}

TzDbMText::AttachmentPoint point(int number) {
    return static_cast<TzDbMText::AttachmentPoint>(number);
}

void expectStays(int from, int to, double width) {
    TzDbMText text;
    describe(text, point(from), width);
    TzArray<TzGePoint3d> before;
    text.getBoundingPoints(before);
    EasyObject<TzDbMText> held(&text, EasyFlags::kNone);
    UpdateAttachPoint(held, point(to), kMeasureHeight);
    EXPECT_EQ(text.attachment(), point(from));
    EXPECT_EQ(text.setAttachment(point(to)), Tzad::eOk);
    TzArray<TzGePoint3d> after;
    text.getBoundingPoints(after);
    ASSERT_EQ(before.length(), 4);
    EXPECT_TRUE(before[0].isEqualTo(after[0], TzGeTol(1e-9)));
    EXPECT_TRUE(before[3].isEqualTo(after[3], TzGeTol(1e-9)));
}

// Without a width the measured one counts, so the text stays. In a box that is wider than its text
// the text moves and the box stays.
TEST(Attachment, LeavesTheTextWhereItIs) {
    OpenDrawing const drawing;
    for (int from = 1; from <= 9; ++from) {
        for (int to = 1; to <= 9; ++to) {
            SCOPED_TRACE(std::to_string(from) + " to " + std::to_string(to));
            expectStays(from, to, 0);
        }
    }
}

// There and back the location would end beside itself in one text of ten.
TEST(Attachment, ThatStaysKeepsTheLocationToTheLastBit) {
    TzDbMText text;
    describe(text, point(9), 3.3);
    EXPECT_EQ(text.setLocation({0.1, 0.2, 0.3}), Tzad::eOk);
    EXPECT_EQ(text.setDirection({0.6, 0.8, 0}), Tzad::eOk);
    EasyObject<TzDbMText> held(&text, EasyFlags::kNone);
    UpdateAttachPoint(held, point(9), kMeasureHeight);
    EXPECT_TRUE(text.location().isEqualTo({0.1, 0.2, 0.3}, TzGeTol(0)));
}

struct MoveRow {
    int from;
    int to;
    double height;
    TzGePoint3d location;  // of a text at 0,0,0 with a width of 10
};
MoveRow const kMoves[] = {
    {1, 1, 4, {0, 0, 0}}, {1, 5, 4, {5, -2, 0}}, {1, 9, 4, {10, -4, 0}}, {9, 1, 4, {-10, 4, 0}},
    {5, 3, 4, {5, 2, 0}}, {7, 9, 0, {10, 0, 0}}, {1, 0, 4, {0, 0, 0}},   {9, 12, 4, {-10, 4, 0}},
};

TEST(Attachment, MovesTheLocationInAGivenBox) {
    OpenDrawing const drawing;
    for (MoveRow const& row : kMoves) {
        SCOPED_TRACE(std::to_string(row.from) + " to " + std::to_string(row.to));
        TzDbMText text;
        text.setDatabaseDefaults();
        EXPECT_EQ(text.setContents(L"Text"), Tzad::eOk);
        EXPECT_EQ(text.setWidth(10), Tzad::eOk);
        EXPECT_EQ(text.setAttachment(point(row.from)), Tzad::eOk);
        EasyObject<TzDbMText> held(&text, EasyFlags::kNone);
        UpdateAttachPoint(held, point(row.to), row.height);
        EXPECT_TRUE(text.location().isEqualTo(row.location));
    }
}

}  // namespace
