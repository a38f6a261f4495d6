// What word processors get of a text, and what becomes of their stacks.

#include <gtest/gtest.h>

#include "host/editors/returned_stacks.h"
#include "host/editors/sent_rtf.h"

namespace {

using namespace tzhost;

struct SentRow {
    char const* name;
    wchar_t const* module;  // behind the tables of a document
    char const* sent;
};
constexpr SentRow kSent[] = {
    {"Style", L"\\pard\\plain\\f0\\cf0\\fs32 \\deftab0 a\\pard b",
     "{\\stylesheet{\\s0\\f0\\fs32\\afs32 Normal;}}\n\\pard\\plain\\f0\\cf0\\fs32 \\deftab0 a\\pard b"},
    {"Toggles", L"{\\b1 \\i0 a}", "{\\b \\i0 a}"},
    {"Characters", L"\\u233?x\\u40000?\\u128512?",
     "\\u233\\'3fx\\u-25536\\'3f\\u-10179\\'3f\\u-8704\\'3f"},
    {"Stack", L"{\\dn1234 \\\\S<1,100>}1/2{\\dn1234 \\\\s}x", "\\\\S1/2;x"},
    {"StackOfASize",
     L"\\fs30 {\\fs20 {\\dn1234 \\\\S<0,75>}1{\\dn1234 \\\\s}}{\\dn1234 \\\\S<0,50>}2{\\dn1234 \\\\s}",
     "\\fs30 {\\fs20 {\\fs15 \\\\S1;}}{\\fs15 \\\\S2;}"},
    {"StackText", L"{\\dn1234 \\\\S<0,100>}\\;\\\\{\\}\x3B1\\u8709?{\\dn1234 \\\\s}",
     "\\\\S\\\\;\\\\\\\\\\{\\\\\\}\\u945\\'3f\\u8709\\'3f;"},
    {"Backslashes",
     L"\\\\S \\\\\\\\\\f1 S \\\\T \\\\\\tab S\\\\{\\dn1234 \\\\S<0,100>}1{\\dn1234 \\\\s}",
     "\\\\\\\\S \\\\\\\\\\f1 \\\\\\\\S \\\\T \\\\\\tab S\\\\\\\\\\\\S1;"},
};

TEST(SentRtf, IsForWordProcessors) {
    for (SentRow const& row : kSent)
        EXPECT_EQ(sentRtf(row.module), row.sent) << row.name;
    std::string const tables =
        sentRtf(L"{\\rtf1{\\fonttbl{\\f0\\fswiss\\fprq2\\fcharset0 A;}{\\f1\\fcharset204 \\'d4;}}"
                L"{\\colortbl\\red255\\green255\\blue255;\\red0\\green0\\blue255;}\\cf0 a}");
    EXPECT_NE(tables.find("{\\colortbl\\red1\\green1\\blue1;\\red0\\green0\\blue255;}\\cf0 a}"),
              tables.npos)
        << tables;
    std::vector<DialectFont> const fonts = fontsOf(tables);
    ASSERT_EQ(fonts.size(), 2U);
    EXPECT_EQ(fonts[0].family + fonts[0].pitch, 0x22);
    EXPECT_EQ(fonts[1].name, L"\x424");
    EXPECT_EQ(fonts[1].charset, 204);
}

struct StackRow {
    char const* name;
    char const* left;  // normalised, behind the tables
    char const* taken;
};
constexpr StackRow kStacks[] = {
    {"Plain", "\\\\S1/2;x", "{\\dn1234 \\\\S}1/2;{\\dn6}x"},
    {"OfALook", "{\\fs20 a\\\\S1;b}", "{\\fs20 a}{\\fs20 {\\dn1234 \\\\S}1;{\\dn6}}{\\fs20 b}"},
    {"ThroughLooks", "{\\b \\\\}{\\i S1}/{\\fs9 2;x}",
     "{\\b }{\\i }{\\i {\\dn1234 \\\\S}1/2;{\\dn6}}{\\fs9 x}"},
    {"OfTheDialect", "{\\fs20\\dn1234 \\\\S}1;{\\dn6}",
     "{\\fs20\\dn1234 }{\\fs20 {\\dn1234 \\\\S}1;{\\dn6}}{\\dn6}"},
    {"Escapes", "\\\\S\\\\;\\\\\\{\\}\\u945?\\\\par\\~;",
     "{\\dn1234 \\\\S}\\\\;\\{\\}\xCE\xB1\\\\\npar\xC2\xA0;{\\dn6}"},
    {"NoEnd", "\\\\Sa\\par\n\\\\Sb;", "\\\\\nSa\\par\n{\\dn1234 \\\\S}b;{\\dn6}"},
    {"Doubled", "\\\\\\\\S1;", "\\\\S1;"},
    {"BesideDoubled", "\\\\\\\\\\\\S1;", "\\\\{\\dn1234 \\\\S}1;{\\dn6}"},
    {"NoSign", "\\\\\\\\s\\\\", "\\\\\\\\s\\\\"},
};

TEST(ReturnedStacks, AreThoseOfTheModule) {
    for (StackRow const& row : kStacks)
        EXPECT_EQ(withStacks(std::string("{\\rtf1\n") + row.left),
                  std::string("{\\rtf1\n") + row.taken)
            << row.name;
}

}  // namespace
