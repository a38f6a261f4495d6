// Texts from the resource library, raw and with variables expanded.

#include <gtest/gtest.h>

#include "module/texts/resources.h"
#include "module/texts/string_table.h"
#include "tests/module_ground/own_texts.h"
#include "tests/module_ground/variables_fixture.h"
#include "tz/rx/resource.h"

namespace {

struct TextRow {
    char const* name;
    unsigned int id;
    wchar_t const* text;
    wchar_t const* expanded;
};
constexpr TextRow kTexts[] = {
    {"Plain", 1, L"Height: %s\n", L"Height: %s\n"},
    {"Empty", 2, L"", L""},
    {"OneVariable", 3, L"Units {LUNITS}.", L"Units 2."},
    {"Two", 4, L"{LUNITS}{TEXTSIZE}", L"20.2"},
    {"BracesByParentheses", 5, L"a{(}b{)}c{(", L"a{b}c{("},
    {"EmptyName", 6, L"a{}b", L"ab"},
    {"UnknownVariable", 7, L"a{NOSUCH}b", L"ab"},
    {"PointVariable", 8, L"a{LASTPOINT}b", L"ab"},
    {"NoClosingBrace", 9, L"a{LUNITS", L"a{LUNITS"},
    {"LoneClosingBrace", 10, L"a}b{LUNITS}", L"a}b2"},
    // A name of 16 characters is looked up; one of 17 stops all expansion after it.
    {"Sixteen", 11, L"{ABCDEFGHIJKLMNOP}{LUNITS}", L"2"},
    {"Seventeen", 12, L"{LUNITS}{ABCDEFGHIJKLMNOPQ}{LUNITS}", L"2{ABCDEFGHIJKLMNOPQ}{LUNITS}"},
    {"BraceInAName", 13, L"{LU{NITS}", L""},
    // What a variable holds is not looked at again.
    {"BracesInAValue", 14, L"<{MTJIGSTRING}>", L"<{LUNITS}>"},
};

int const kTextCount = [] {
    tzhost::ResourceTexts texts;
    for (TextRow const& row : kTexts)
        texts[row.id] = row.text;
    texts[1096] = L"%s|%s|%s|%s";
    texts[229] = L"too new";
    return ownTexts(texts);
}();

class Texts : public WithVariables, public testing::WithParamInterface<TextRow> {};
TEST_P(Texts, AreExpanded) {
    give(L"MTJIGSTRING", L"{LUNITS}");
    EXPECT_EQ(loadResourceString(static_cast<int>(GetParam().id)).str(), GetParam().text);
    EXPECT_EQ(gStringTable[GetParam().id].str(), GetParam().expanded);
}
INSTANTIATE_TEST_SUITE_P(Forms, Texts, testing::ValuesIn(kTexts), [](auto const& row) {
    return row.param.name;
});

TEST(TextsOfTheModule, AreEmptyWithoutAnId) {
    EXPECT_GT(kTextCount, 0);
    EXPECT_TRUE(getMteResourceInstance().isLoaded());
    EXPECT_EQ(&getMteResourceInstance(), &getMteResourceInstance());
    EXPECT_TRUE(loadResourceString(999).isEmpty());
    EXPECT_TRUE(gStringTable[999].isEmpty());
    EXPECT_EQ(getWarningId(12167), L"TzMte12167");
}

}  // namespace
