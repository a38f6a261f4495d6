#include "tests/database/drawing_fixture.h"
#include "tz/db/text.h"
#include "tz/gi/text_style.h"
#include "tz/rx/resbuf.h"

using tzhost::test::DrawingTest;

namespace {

// The text box of an entity, or nothing but the status.
struct Box {
    int status = 0;
    double low[3] = {};
    double high[3] = {};
};

Box boxOf(TzDbObjectId id) {
    long long name[2];
    EXPECT_EQ(tzdbGetTzsName(name, id), 0);
    resbuf* const data = tzdbEntGet(name);
    Box box;
    box.status = tzedTextBox(data, box.low, box.high);
    tzutRelRb(data);
    return box;
}

// A monospaced face has one advance for all letters, so every size follows from one.
TEST_F(DrawingTest, SizesFollowTheTextHeight) {
    TzDbObjectId const style = addStyle(L"Mono", L"DejaVu Sans Mono");
    TzDbMText text;
    ASSERT_EQ(text.setTextStyle(style), Tzad::eOk);
    ASSERT_EQ(text.setTextHeight(1), Tzad::eOk);
    ASSERT_EQ(text.setContents(L"i"), Tzad::eOk);
    double const advance = text.actualWidth();
    ASSERT_GT(advance, 0.0);
    for (double const height : {1e-6, 0.2, 1e9}) {
        ASSERT_EQ(text.setTextHeight(height), Tzad::eOk);
        ASSERT_EQ(text.setContents(L"iiWW"), Tzad::eOk);
        EXPECT_NEAR(text.actualWidth() / height / advance, 4.0, 4e-5);
        EXPECT_NEAR(text.actualHeight() / height, 1.0, 1e-9);
        ASSERT_EQ(text.setContents(L"ii\\PWW"), Tzad::eOk);
        EXPECT_NEAR(text.actualHeight() / height, 1.0 + 5.0 / 3.0, 1e-9);
    }
}

TEST_F(DrawingTest, ChangedStyleIsMeasuredAnew) {
    TzDbObjectId const id = addText(L"abc");
    double const before = at<TzDbMText>(id).actualWidth();
    TzDbTextStyleTableRecord* style = nullptr;
    ASSERT_EQ(tzdbOpenObject(style, drawing->textstyle(), TzDb::kForWrite), Tzad::eOk);
    ASSERT_EQ(style->setXScale(2), Tzad::eOk);
    EXPECT_EQ(style->close(), Tzad::eOk);
    EXPECT_NEAR(at<TzDbMText>(id).actualWidth(), 2 * before, before * 1e-6);
}

TEST_F(DrawingTest, BoxOfALineStandsInItsOwnFrame) {
    auto* const text = new TzDbText;
    text->setDatabaseDefaults(drawing.get());
    (void)text->setTextString(L"abc");
    (void)text->setHeight(2);
    (void)text->setPosition({10, 20, 30});
    (void)text->setRotation(1);
    Box const box = boxOf(add(text));
    EXPECT_EQ(box.status, Tzad::ePromptNormal);
    EXPECT_EQ(box.low[0], 0.0);
    EXPECT_NEAR(box.high[1] - box.low[1], 2.0, 1e-9);
    // A character written by its code used to count as the letters of the code.
    auto* const coded = new TzDbText;
    coded->setDatabaseDefaults(drawing.get());
    (void)coded->setTextString(L"a\\U+0062c");
    (void)coded->setHeight(2);
    EXPECT_NEAR(boxOf(add(coded)).high[0], box.high[0], 1e-9);
    TzGiTextStyle style;
    ASSERT_EQ(fromTzDbTextStyle(style, drawing->textstyle()), Tzad::eOk);
    style.setTextSize(2);
    EXPECT_NEAR(style.extents(L"a\\U+0062c", true, -1, false).x, box.high[0], 1e-9);
    EXPECT_NEAR(style.extents(L"abcdef", true, 3, true).x, box.high[0], 1e-9);
    // The "@" of a vertical face used to give the width of a stack of letters.
    TzGiTextStyle plain = style;
    plain.setFont(L"DejaVu Sans", false, false, 0, 0);
    style.setFont(L"@DejaVu Sans", false, false, 0, 0);
    EXPECT_DOUBLE_EQ(style.extents(L"abc", true, 3, true).x,
                     plain.extents(L"abc", true, 3, true).x);
}

TEST_F(DrawingTest, BoxOfADefinitionHoldsItsLines) {
    auto* definition = new TzDbAttributeDefinition;
    definition->setDatabaseDefaults(drawing.get());
    (void)definition->setTag(L"NAME");
    TzDbObjectId const id = add(definition);
    double const single = boxOf(id).high[0];
    ASSERT_EQ(tzdbOpenObject(definition, id, TzDb::kForWrite), Tzad::eOk);
    auto* const lines = new TzDbMText;
    lines->setDatabaseDefaults(drawing.get());
    (void)lines->setContents(L"two words");
    ASSERT_EQ(definition->setMTextAttributeDefinition(lines), Tzad::eOk);
    EXPECT_EQ(lines->database(), drawing.get());
    ASSERT_EQ(lines->setWidth(0.3), Tzad::eOk);
    Box const wrapped = boxOf(id);
    ASSERT_EQ(lines->setWidth(0), Tzad::eOk);
    Box const plain = boxOf(id);
    EXPECT_EQ(definition->downgradeOpen(), Tzad::eOk);
    EXPECT_EQ(lines->setWidth(1), Tzad::eNotOpenForWrite);
    EXPECT_EQ(definition->close(), Tzad::eOk);
    EXPECT_GT(plain.high[0], single);
    EXPECT_GT(plain.high[0], wrapped.high[0]);
    EXPECT_NEAR(wrapped.high[1] - wrapped.low[1], 0.2 * (1 + 5.0 / 3.0), 1e-9);
    EXPECT_NEAR(wrapped.high[1], 0.0, 1e-12);
}

TEST_F(DrawingTest, WhatIsNoTextHasNoBox) {
    EXPECT_EQ(boxOf(addText(L"abc")).status, Tzad::ePromptError);
    double corner[3];
    EXPECT_EQ(tzedTextBox(nullptr, corner, corner), Tzad::ePromptError);
    long long const none[2] = {1, 0};
    EXPECT_EQ(tzdbEntGet(none), nullptr);
}

}  // namespace
