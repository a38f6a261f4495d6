#include <cstdlib>

#include "host/settings/variables.h"
#include "tests/database/drawing_fixture.h"
#include "tz/db/field.h"

using tzhost::test::DrawingFixture;
using tzhost::test::DrawingTest;

namespace {

struct FieldCase {
    char const* name;
    wchar_t const* code;
    wchar_t const* shown;
    Tzad::ErrorStatus status;
};

constexpr FieldCase kFields[] = {
    {"Variable", L"n=%<\\Var LUNITS>%;", L"n=2;", Tzad::eOk},
    {"LowerCase", L"%<\\Var textsize>%", L"0.2", Tzad::eOk},
    {"NoVariable", L"%<\\Var NOSUCH>%", L"####", Tzad::eFieldNotEvaluated},
    {"Date", L"%<\\Date>%", L"2001-09-09", Tzad::eOk},
    {"File", L"%<\\File>%", L"plan.json", Tzad::eOk},
    {"ObjectText", L"%<\\Object 1 contents>%", L"abc", Tzad::eOk},
    {"ObjectHeight", L"%<\\Object 1 TextHeight>%", L"0.2", Tzad::eOk},
    {"NoObject", L"%<\\Object FF contents>%", L"####", Tzad::eFieldNotEvaluated},
    {"WideHandle", L"%<\\Object \u0131 contents>%", L"####",
     Tzad::eFieldNotEvaluated},  // read as 1
    {"TablesHandle", L"%<\\Object 4000000000000000 handle>%", L"####", Tzad::eFieldNotEvaluated},
    {"NoProperty", L"%<\\Object 1 radius>%", L"####", Tzad::eFieldNotEvaluated},
    {"HandleTooLong", L"%<\\Object 11112222333344445 x>%", L"####", Tzad::eFieldNotEvaluated},
    {"UnknownWord", L"a %<\\Weather>% b", L"a #### b", Tzad::eFieldNotEvaluated},
    {"TwoCodes", L"%<\\Var LUNITS>%%<\\Var LUPREC>%", L"24", Tzad::eOk},
    {"NotClosed", L"%<\\Var LUNITS", L"%<\\Var LUNITS", Tzad::eOk},
    {"NoCode", L"50 %< 60", L"50 %< 60", Tzad::eOk},
    {"InnerStart", L"%<\\Var %<\\Var LUNITS>%>%", L"####>%", Tzad::eFieldNotEvaluated},
};

class Fields : public testing::TestWithParam<FieldCase>, protected DrawingFixture {};

TEST_P(Fields, Show) {
    setenv("SOURCE_DATE_EPOCH", "1000000000", 1);
    addText(L"abc");
    drawing->setFile("/somewhere/plan.json");
    TzDbField field;
    ASSERT_EQ(field.setFieldCode(GetParam().code, 0, nullptr), Tzad::eOk);
    EXPECT_EQ(field.getFieldCode(2), GetParam().code) << "not evaluated yet";
    EXPECT_EQ(field.evaluate(0x20, drawing.get()), GetParam().status);
    EXPECT_EQ(field.getFieldCode(2), GetParam().shown);
    EXPECT_EQ(field.getFieldCode(0), GetParam().code);
    unsetenv("SOURCE_DATE_EPOCH");
}

INSTANTIATE_TEST_SUITE_P(Codes, Fields, testing::ValuesIn(kFields), [](auto const& row) {
    return row.param.name;
});

// It used to be the first day of 1970.
TEST_F(DrawingTest, DateOfNoNumberIsThatOfTheClock) {
    setenv("SOURCE_DATE_EPOCH", "soon", 1);
    TzDbField field;
    ASSERT_EQ(field.setFieldCode(L"%<\\Date>%", 0, nullptr), Tzad::eOk);
    EXPECT_EQ(field.evaluate(0x20, drawing.get()), Tzad::eOk);
    EXPECT_GT(field.getFieldCode(2).str(), L"2000");
    unsetenv("SOURCE_DATE_EPOCH");
}

TEST_F(DrawingTest, FieldLivesFromAppendingToErasing) {
    TzDbObjectId const id = addText(L"[%<\\Var LUNITS>%]");
    TzDbMText* text = nullptr;
    ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForRead), Tzad::eOk);
    EXPECT_EQ(text->contents(), L"[2]");
    TzDbField* field = nullptr;
    ASSERT_EQ(text->getField(L"TEXT", field, TzDb::kForWrite), Tzad::eOk);
    (void)tzhost::Variables::instance().set(L"LUNITS", short{4}, tzhost::Writer::user);
    EXPECT_EQ(field->evaluate(0x20, drawing.get()), Tzad::eOk);
    EXPECT_EQ(text->contents(), L"[4]") << "the text follows, though it is open for read";
    EXPECT_EQ(field->erase(), Tzad::eOk);
    EXPECT_EQ(field->close(), Tzad::eOk);
    EXPECT_EQ(text->getField(L"TEXT", field, TzDb::kForRead), Tzad::eKeyNotFound);
    EXPECT_EQ(field, nullptr);
    EXPECT_EQ(text->contents(), L"[4]");
    EXPECT_EQ(text->close(), Tzad::eOk);
}

// Two fields, each of which shows the other's text twice, used to take all memory.
TEST_F(DrawingTest, FieldsOfOneTextHaveALength) {
    addText(std::wstring(60'000, L'x').c_str());
    TzDbField field;
    ASSERT_EQ(field.setFieldCode(L"%<\\Object 1 contents>%%<\\Object 1 contents>%%<\\Var LUNITS>%",
                                 0, nullptr),
              Tzad::eOk);
    EXPECT_EQ(field.evaluate(0x20, drawing.get()), Tzad::eFieldNotEvaluated);
    EXPECT_EQ(field.getFieldCode(2).str(), std::wstring(60'000, L'x') + L"####2");
}

TEST_F(DrawingTest, FieldNeedsADrawing) {
    TzDbMText text;
    TzDbField field;
    TzDbObjectId id;
    EXPECT_EQ(text.setField(L"TEXT", &field, id), Tzad::eNoDatabase);
    EXPECT_TRUE(id.isNull());
    EXPECT_EQ(field.close(), Tzad::eNoDatabase);
}

TEST_F(DrawingTest, NewTextTakesThePlaceOfAField) {
    TzDbObjectId const id = addText(L"%<\\Var LUNITS>%");
    TzDbMText* text = nullptr;
    ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(text->setContents(L"plain"), Tzad::eOk);
    TzDbField* field = nullptr;
    EXPECT_EQ(text->getField(L"TEXT", field, TzDb::kForRead), Tzad::eKeyNotFound);
    auto* const next = new TzDbField;
    EXPECT_EQ(next->setFieldCode(L"%<\\Nothing>%", 0x100, nullptr), Tzad::eOk);
    TzDbObjectId fieldId;
    EXPECT_EQ(text->setField(L"TEXT", next, fieldId), Tzad::eOk);
    EXPECT_EQ(next->close(), Tzad::eOk);
    EXPECT_EQ(text->contents(), L"####");
    EXPECT_EQ(text->close(), Tzad::eOk);
}

TEST_F(DrawingTest, FieldsAreFoundFromWhereOneAsks) {
    int first = -1;
    int end = -1;
    wchar_t const* const text = L"a%<\\Date>%b%<\\File>%";
    EXPECT_TRUE(tzdbFindField(text, 0, first, end));
    EXPECT_EQ(std::pair(first, end), std::pair(1, 10));
    EXPECT_TRUE(tzdbFindField(text, 2, first, end));
    EXPECT_EQ(std::pair(first, end), std::pair(11, 20));
    EXPECT_FALSE(tzdbFindField(text, 99, first, end));
    EXPECT_FALSE(tzdbFindField(nullptr, 0, first, end));
}

}  // namespace
