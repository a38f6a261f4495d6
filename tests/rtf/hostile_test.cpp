// Malformed and oversized documents: each is read to its end, in time linear in its length, without
// the call stack. The sizes are such that reading anything over and over would not end here.

#include <string>

#include <gtest/gtest.h>

#include "host/rtf/normaliser.h"

namespace {

struct HostileCase {
    char const* name;
    char const* head;
    char const* unit;  // a "#" is its number
    int count;
    int growth;  // bytes of the result for one of the document, at most
};

constexpr HostileCase kCases[] = {
    {"OpenGroups", "{\\rtf1 ", "{", 2000000, 1},
    {"GroupsWithLooks", "{\\rtf1 ", "{\\b\\fs#\\li# a", 200000, 4},
    {"Closings", "a", "}", 2000000, 1},
    {"FontTables", "", "{\\fonttbl", 300000, 1},
    {"FontsCutOff", "{\\fonttbl", "{\\f1 A", 300000, 1},
    {"ManyFonts", "{\\fonttbl", "{\\f#\\fcharset0 Font #;}", 300000, 1},
    {"ManyFontsInUse", "", "{\\fonttbl{\\f# F#;}}\\f# a", 100000, 3},
    {"LongName", "{\\fonttbl{\\f1 ", "n", 2000000, 1},
    {"ColorTables", "", "{\\colortbl;", 300000, 1},
    {"Styles", "{\\stylesheet", "{\\s#\\sbasedon1\\b#;}", 200000, 1},
    {"StylesOneOnAnother", "{\\stylesheet{\\s1\\sbasedon2}{\\s2\\sbasedon1}}", "\\s1 a\\s2 b",
     200000, 2},
    {"Destinations", "", "{\\*\\x", 300000, 1},
    {"BinaryWithoutData", "{\\rtf1 a", "\\bin2000000000 ", 100000, 1},
    {"CodesWithoutNumber", "", "\\u", 500000, 1},
    {"LongSubstitutes", "\\uc1000000000 ", "\\u233 a", 200000, 2},
    {"CutOffEscapes", "", "\\'", 500000, 1},
    {"LoneBackslashes", "", "\\", 1000001, 2},
    {"PagesInTurns", "{\\fonttbl{\\f1\\fcharset204 A;}{\\f2\\fcharset128 B;}}",
     "\\f1\\'e0\\f2\\'e0", 200000, 3},
    {"UnknownPages", "{\\fonttbl", "{\\f#\\cpg# \\'e9;}", 100000, 1},
    {"Paragraphs", "", "\\pard\\par", 300000, 2},
    {"Rows", "", "\\trowd\\cellx#\\cell\\row", 200000, 2},
    {"Tabs", "", "\\tx#", 500000, 1},
    {"StackSigns", "", "\\\\S\\tab", 300000, 3},
    {"LongWord", "\\", "a", 2000000, 1},
    {"OneLetter", "", "a", 5000000, 1},
};

class Hostile : public testing::TestWithParam<HostileCase> {};
TEST_P(Hostile, IsReadToItsEnd) {
    std::string rtf = GetParam().head;
    for (int i = 0; i < GetParam().count; ++i) {
        for (char const* c = GetParam().unit; *c != 0; ++c)
            rtf += *c == '#' ? std::to_string(i) : std::string(1, *c);
    }
    std::size_t const most = rtf.size() * static_cast<std::size_t>(GetParam().growth) + 500;
    EXPECT_LE(tzhost::normaliseRtf(rtf).document.size(), most);
}
INSTANTIATE_TEST_SUITE_P(Documents, Hostile, testing::ValuesIn(kCases), [](auto const& row) {
    return row.param.name;
});

}  // namespace
