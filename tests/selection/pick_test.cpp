// Picks of one entity, at the top and inside block references.

#include <gtest/gtest.h>

#include "host/command_line/point_input.h"
#include "tests/selection/drawing_session.h"
#include "tz/ed/prompts.h"
#include "tz/rx/resbuf.h"

namespace {

using tzhost::test::OpenDrawing;
using tzhost::test::ScriptedSession;

// A block "Inner" with a line from 0,0 to 1,1; "Outer" refers to it at 10,0 and holds a line from
// 0,0 to 4,0; the model refers to "Outer" at 100,0 with an attribute at 100,50 and holds a line
// beside it.
class Picks : public testing::Test {
protected:
    Picks() {
        TzDbObjectId const inner = drawing_.addBlock(L"Inner");
        TzDbObjectId const outer = drawing_.addBlock(L"Outer");
        innerLine_ = drawing_.addLine({0, 0, 0}, {1, 1, 0}, L"Inner");
        outerLine_ = drawing_.addLine({0, 0, 0}, {4, 0, 0}, L"Outer");
        innerReference_ = drawing_.add(reference(inner, {10, 0, 0}), L"Outer");
        line_ = drawing_.addLine({0, 0, 0}, {2, 2, 0});
        reference_ = drawing_.add(reference(outer, {100, 0, 0}));
        attribute_ = addAttribute();
    }

    static TzDbBlockReference* reference(TzDbObjectId block, TzGePoint3d const& at) {
        auto* const entity = new TzDbBlockReference;
        entity->setDatabaseDefaults();
        EXPECT_EQ(entity->setBlockTableRecord(block), Tzad::eOk);
        EXPECT_EQ(entity->setPosition(at), Tzad::eOk);
        return entity;
    }
    std::string addAttribute() {
        auto* const attribute = new TzDbAttribute;
        attribute->setDatabaseDefaults();
        EXPECT_EQ(attribute->setHeight(1), Tzad::eOk);
        EXPECT_EQ(attribute->setPosition({100, 50, 0}), Tzad::eOk);
        EXPECT_EQ(attribute->setTextString(L"WW"), Tzad::eOk);
        TzDbBlockReference* owner = nullptr;
        TzDbObjectId id;
        EXPECT_EQ(tzdbOpenObject(owner, drawing_.id(reference_), TzDb::kForWrite), Tzad::eOk);
        EXPECT_EQ(owner->appendAttribute(id, attribute), Tzad::eOk);
        EXPECT_EQ(attribute->close(), Tzad::eOk);
        EXPECT_EQ(owner->close(), Tzad::eOk);
        return OpenDrawing::handle(id);
    }

    // "$L" and so on stand for handles.
    std::string expanded(std::string_view text) const {
        std::string result;
        for (std::size_t i = 0; i < text.size(); ++i) {
            if (text[i] != '$') {
                result += text[i];
                continue;
            }
            switch (text[++i]) {
            case 'L': result += line_; break;
            case 'R': result += reference_; break;
            case 'A': result += attribute_; break;
            case 'o': result += outerLine_; break;
            case 'r': result += innerReference_; break;
            default: result += innerLine_; break;
            }
        }
        return result;
    }

    OpenDrawing drawing_;
    std::string innerLine_, outerLine_, innerReference_, line_, reference_, attribute_;
};

struct PickRow {
    char const* name;
    std::string_view script;
    std::string_view top;     // of tzedEntSel: status, handle, point
    std::string_view nested;  // of tzedNEntSelP: status, handle, where its origin lies, references
};

// Flags 1 are armed with the keyword "Point"; the last point is 7,8,9.
constexpr PickRow kPicks[] = {
    {"Point", "1,1", "5100 $L 1,1,0", "5100 $L 0,0 []"},
    {"InBlock", "102,0", "5100 $R 102,0,0", "5100 $o 100,0 [$R]"},
    {"InInnerBlock", "110.5,0.5", "5100 $R 110.5,0.5,0", "5100 $i 110,0 [$r $R]"},
    {"BetweenParts", "107,0.5", "5100 $R 107,0.5,0", "-5001"},
    {"Attribute", "101,50.5", "5100 $R 101,50.5,0", "5100 $A 0,0 []"},
    {"Nothing", "-50,-50", "-5001", "-5001"},
    {"Handle", "#$L", "5100 $L 7,8,9", "5100 $L 0,0 []"},
    {"NestedHandle", "#$R/$o", "5100 $R 7,8,9", "5100 $o 100,0 [$R]"},
    {"DeepHandle", "#$R/$r/$i", "5100 $R 7,8,9", "5100 $i 110,0 [$r $R]"},
    {"AttributeHandle", "#$R/$A", "5100 $R 7,8,9", "5100 $A 0,0 []"},
    {"NotInside", "#$R/$L\n#$o\n#\n\n#$L", "5100 $L 7,8,9", "5100 $L 0,0 []"},
    {"Keyword", "p", "-5005", "-5005"},
    {"Cancel", "x\n^C", "-5002", "-5002"},
};

class PickTable : public Picks, public testing::WithParamInterface<PickRow> {};

TEST_P(PickTable, AtTheTop) {
    ScriptedSession const session(expanded(GetParam().script) + "\n");
    tzhost::setLastPoint({7, 8, 9});
    ASSERT_EQ(tzedInitGet(1, L"Point"), Tzad::ePromptNormal);
    long long name[2] = {};
    double point[3] = {};
    int const status = tzedEntSel(nullptr, name, point);
    std::string result = std::to_string(status);
    if (status == Tzad::ePromptNormal) {
        result += " " + OpenDrawing::handleOf(name) +
                  TzString::formatted(L" %g,%g,%g", point[0], point[1], point[2]).toUtf8();
    }
    EXPECT_EQ(result, expanded(GetParam().top));
}

TEST_P(PickTable, Nested) {
    ScriptedSession const session(expanded(GetParam().script) + "\n");
    ASSERT_EQ(tzedInitGet(1, L"Point"), Tzad::ePromptNormal);
    long long name[2] = {};
    double point[3] = {};
    double matrix[4][4] = {};
    resbuf* references = nullptr;
    int const status = tzedNEntSelP(L"", name, point, 0, matrix, &references);
    std::string result = std::to_string(status);
    if (status == Tzad::ePromptNormal) {
        result += " " + OpenDrawing::handleOf(name) +
                  TzString::formatted(L" %g,%g", matrix[0][3], matrix[1][3]).toUtf8() + " [";
        for (resbuf const* each = references; each != nullptr; each = each->rbnext) {
            result += (each == references ? "" : " ") + OpenDrawing::handleOf(each->resval.rlname);
        }
        result += "]";
    }
    tzutRelRb(references);
    EXPECT_EQ(result, expanded(GetParam().nested));
}
INSTANTIATE_TEST_SUITE_P(Answers, PickTable, testing::ValuesIn(kPicks), [](auto const& row) {
    return row.param.name;
});

// A backward text was picked to the right of its position, where nothing is drawn.
TEST_F(Picks, BackwardTextsAreWhereTheyAreDrawn) {
    TzDbTextStyleTableRecord* style = nullptr;
    TzDbObjectId const id = tzhost::workingDrawing()->textstyle();
    ASSERT_EQ(tzdbOpenObject(style, id, TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(style->setFlagBits(2), Tzad::eOk);
    EXPECT_EQ(style->close(), Tzad::eOk);
    ScriptedSession const session("99,50.5\n");
    long long name[2] = {};
    double point[3] = {};
    EXPECT_EQ(tzedEntSel(nullptr, name, point), Tzad::ePromptNormal);
    EXPECT_EQ(OpenDrawing::handleOf(name), reference_);
}

TEST_F(Picks, AtAGivenPointAskNothing) {
    ScriptedSession const session("");
    long long name[2] = {};
    double point[3] = {102, 0, 0};
    EXPECT_EQ(tzedNEntSelP(nullptr, name, point, 1, nullptr, nullptr), Tzad::ePromptNormal);
    EXPECT_EQ(OpenDrawing::handleOf(name), outerLine_);
    EXPECT_EQ(session.transcript(), L"");
}

}  // namespace
