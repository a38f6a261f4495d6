// What becomes of a document, as it is written in the dialect.

#include <gtest/gtest.h>

#include "host/rtf/normaliser.h"

namespace {

using std::string_view_literals::operator""sv;

struct Case {
    char const* name;
    std::string_view rtf;
    char const* written;  // from the second line (the first has the tables) to the last paragraph
};

std::string bodyOf(std::string_view rtf) {
    std::string const document = tzhost::normaliseRtf(rtf).document;
    std::size_t const start = document.find('\n') + 1;
    return document.substr(start, document.rfind("\\par\n") - start);
}

class Bodies : public testing::TestWithParam<Case> {};
TEST_P(Bodies, AreWrittenAs) {
    EXPECT_EQ(bodyOf(GetParam().rtf), GetParam().written);
}

constexpr auto kName = [](auto const& row) { return row.param.name; };

constexpr Case kTexts[] = {
    {"Plain", "{\\rtf1 a b}"sv, "\\pard a b"},
    {"NoRtf", "a b"sv, "\\pard a b"},
    {"Signs", "\\{a\\}\\\\b\\~c\\_d\\-e"sv, "\\pard \\{a\\}\\\\b\\~c\\u8209?de"},
    {"NamedCharacters", "\\bullet\\emdash\\ldblquote a\\rquote\\emspace b"sv,
     "\\pard \\u8226?\\u8212?\\u8220?a\\u8217?  b"},
    {"TabsAndLines", "a\\tab b\\line c\\'09d\te"sv, "\\pard a\\tab b\\line c\\tab d\\tab e"},
    {"ControlsAreNone",
     "a\\'01\x02\\u7 ?\x7F"
     "b"sv,
     "\\pard ab"},
    // Unicode and its substitutes.
    {"OneSubstitute", "\\u233?\\u-3913 ?b"sv, "\\pard \\u233?\\u61623?b"},
    {"NoSubstitute", "{\\uc0\\u233 a}\\u233 bc"sv, "\\pard \\u233?a\\u233?c"},
    {"LongSubstitutes", "\\uc3\\u233\\'41B\\endash c"sv, "\\pard \\u233?c"},
    // The text "bullet" went as a whole, as if it were the word of that name.
    {"SubstituteInAName", "\\u233 bullet\\endash c"sv, "\\pard \\u233?ullet\\u8211?c"},
    {"SubstitutesMissing", "\\uc2\\u233\\par\\u233 {a}\\u233\\u234 abc"sv,
     "\\pard \\u233?\\par\n\\pard \\u233?a\\u233?\\u234?c"},
    {"Surrogates", "\\u-10179?\\u-8704?{\\uc0 \\u55357\\uc1 \\u56832\\'3f}\\u128512?"sv,
     "\\pard \xF0\x9F\x98\x80\xF0\x9F\x98\x80\xF0\x9F\x98\x80"},
    {"HalfSurrogates", "\\u55357?a\\u56832?"sv, "\\pard \\u65533?a\\u65533?"},
    // Code pages.
    {"SystemPage", "\\'e9\xE9"sv, "\\pard \\u233?\\u233?"},
    {"DocumentPage", "\\ansicpg1251\\'c0"sv, "\\pard \\u1040?"},
    {"MacPage", "{\\rtf1\\mac \\'8a}"sv, "\\pard \\u228?"},
    {"Utf8Page",
     "\\ansicpg65001 \xC3\xA9\\'c3\\'a9\xC3"
     "a"sv,
     "\\pard \\u233?\\u233?\\u195?a"},
    {"PageThatIsNone", "\\ansicpg4711 \\'e9"sv, "\\pard \\u233?"},
    {"PageOfFont",
     "{\\fonttbl{\\f1\\fcharset204 A;}{\\f2\\fcharset0\\cpg1253 B;}}{\\f1 \\'c0}{\\f2\\'c1}\\'c0"sv,
     "\\pard {\\f0 \\u1040?}{\\f1 \\u913?}\\u192?"},
    {"TwoBytes", "{\\fonttbl{\\f1\\fcharset128 A;}}\\f1\\'90\\'7d\\'83e\x83\x65\\'83\\b0\\'b1x"sv,
     "\\pard {\\f0 \\u22259?\\u12486?\\u12486?\\u131?\\u65393?x"},
    {"SymbolFace",
     "{\\fonttbl{\\f1\\fcharset2 Symbol;}{\\f2\\fcharset2 Own;}}\\f1\\'b7 m\\u-3987 ?\\f2 a"sv,
     "\\pard \\u8226? \\u956?\\u956?{\\f1 \\u61537?"},
};
INSTANTIATE_TEST_SUITE_P(Texts, Bodies, testing::ValuesIn(kTexts), kName);

constexpr Case kLooks[] = {
    {"Groups", "a{\\b b{\\i c}\\b0 d}e"sv, "\\pard a{\\b b}{\\b\\i c}de"},
    {"Lines", "{\\uldb a\\ul0 b\\ulw c\\ulnone d\\striked1 e}"sv,
     "\\pard {\\ul a}b{\\ul c}d{\\strike e"},
    {"PlainEndsThem", "\\b\\i a\\plain b"sv, "\\pard {\\b\\i a}b"},
    {"Sizes", "\\fs20 a\\fs0 b\\fs24 c"sv, "\\pard {\\fs20 a}{\\fs24 bc"},
    {"Colors",
     "{\\colortbl;\\red255\\green1\\blue0;\\red0\\green0\\blue0;}a\\cf1 b\\cf2 c\\cf0 d\\cf9 e"sv,
     "\\pard a{\\cf0 b}{\\cf1 c}de"},
    {"Fonts", "\\deff5{\\fonttbl\\f5 A;{\\f7 B{\\*\\falt C};}}a\\f7 b\\f9 c\\plain d"sv,
     "\\pard {\\f0 a}{\\f1 b}c{\\f0 d"},
    {"WideText", "\\rtlch\\afs20\\ltrch\\fs30{\\dbch\\afs40\\ab a{\\loch b}}{\\dbch c"sv,
     "\\pard {\\fs40\\b a}{\\fs30 bc"},
    {"HiddenAndDeleted", "a{\\v b\\tab\\line}{\\deleted c}d"sv, "\\pard ad"},
    {"Capitals", "{\\caps a\\'e9}b"sv, "\\pard A\\u201?b"},
    {"Baseline", "m{\\super 2}{\\up6 3}{\\dn4 4}"sv, "\\pard m234"},
    {"UnknownWords", "{\\loch\\af3\\hich a{\\lang1033 b}}"sv, "\\pard ab"},
    // The mark of a paragraph has no look of its own unless the paragraph is empty.
    {"Marks", "{\\b a}\\par{\\b\\par}{\\fs20\\par}b"sv,
     "\\pard {\\fs24\\b a}{\\fs24 \\par\n\\pard }{\\fs24\\b \\par\n\\pard }{\\fs20 \\par\n}"
     "\\pard {\\fs24 b"},
};
INSTANTIATE_TEST_SUITE_P(Looks, Bodies, testing::ValuesIn(kLooks), kName);

constexpr Case kParagraphs[] = {
    {"Settings", "\\li720\\fi-360\\tx720 a\\par\\pard b"sv,
     "\\pard\\fi-360\\li720\\tx720 a\\par\n\\pard b"},
    // The group went on over the end, so that a second pass lost the indent where it closes.
    {"LookOverAParagraph", "\\li100{\\b a\\par b}c"sv,
     "\\pard\\li100 {\\b a\\par\n}\\pard\\li100 {\\b b}c"},
    {"SettingsAtTheEnd", "{\\pard\\li100 a}\\li200\\par{\\pard\\li300 b}"sv,
     "\\pard\\li200 a\\par\n\\pard\\li300 b"},
    {"Breaks", "a\\page b\\sect\\sectd c\\column\\page d"sv,
     "\\pard a\\par\n\\pard b\\par\n\\pard c\\par\n\\pard d"},
    {"Lists",
     "{\\pntext\\f1\\'b7\\tab}{\\*\\pn\\pnlvlblt}a\\par{\\listtext\\pard 1.\\tab}\\ls1\\li9 b"sv,
     "\\pard \\u183?\\tab a\\par\n\\pard\\li9 1.\\tab b"},
    {"Styles",
     "{\\stylesheet{\\fs20 Normal;}{\\s1\\sbasedon0\\b\\li50 H;}{\\*\\cs2\\i C;}{\\*\\ts3\\ul T;}}"
     "\\pard\\plain\\s1 a{\\cs2 b}\\b0 c\\par\\pard\\li9\\s1\\fs30 d"sv,
     "\\pard\\li50 {\\fs20\\b a}{\\fs20\\b\\i b}{\\fs20 c\\par\n}\\pard\\li9 {\\fs30 d"},
    {"StylesInACircle", "{\\stylesheet{\\s1\\sbasedon2\\b;}{\\s2\\sbasedon1\\i;}}\\s1 a"sv,
     "\\pard {\\b\\i a"},
    {"Table",
     "\\trowd\\cellx100\\cellx200\\pard\\intbl a\\cell b\\par{\\i c}\\cell\\row\\trowd"
     "\\cellx50 \\cell\\cell d\\cell\\row\\pard e"sv,
     "\\pard\\tx100 a\\tab b {\\i c}\\par\n\\pard \\tab \\tab d\\par\n\\pard e"},
    {"TableInATable",
     "\\trowd\\intbl a{\\nestcell b\\nestcell{\\*\\nesttableprops\\trowd\\nestrow}"
     "{\\nonesttables\\par}}\\cell c\\cell\\row"sv,
     "\\pard a b\\tab c"},
    {"MoreTabsThanRead",
     "\\tx1\\tx2\\tx3\\tx4\\tx5\\tx6\\tx7\\tx8\\tx9\\tx10\\tx11\\tx12\\tx13\\tx14\\tx15\\tx16\\tx17"
     "\\tx18\\tx19\\tx20\\tx21\\tx22\\tx23\\tx24\\tx25\\tx26\\tx27\\tx28\\tx29\\tx30\\tx31"
     "\\tx32\\tx33\\tx0 a"sv,
     "\\pard\\tx1\\tx2\\tx3\\tx4\\tx5\\tx6\\tx7\\tx8\\tx9\\tx10\\tx11\\tx12\\tx13\\tx14\\tx15"
     "\\tx16\\tx17\\tx18\\tx19\\tx20\\tx21\\tx22\\tx23\\tx24\\tx25\\tx26\\tx27\\tx28\\tx29\\tx30"
     "\\tx31\\tx32 a"},
};
INSTANTIATE_TEST_SUITE_P(Paragraphs, Bodies, testing::ValuesIn(kParagraphs), kName);

constexpr Case kGroups[] = {
    {"Unknown", "a{\\*\\new b{c}}{\\new d}{\\*\\fldrslt e}"sv, "\\pard ade"},
    {"Fields", "{\\field{\\*\\fldinst X \"y\"}{\\fldrslt{\\ul z}}}"sv, "\\pard {\\ul z"},
    {"BothForms", "{\\upr{a}{\\*\\ud{\\u233 ?}}}b"sv, "\\pard \\u233?b"},
    {"Binary", "{\\pict\\bin4 }}}}a}b"sv, "\\pard b"},
    {"BraceTooMany", "{a}}}b"sv, "\\pard ab"},
    {"InfoAndTables", "{\\info{\\title t}}{\\*\\listtable{\\list x}}{\\header h}a"sv, "\\pard a"},
    {"Object", "{\\object{\\*\\objdata 0102}{\\result{\\pict 0f}b}}"sv, "\\pard b"},
    // A stack's mark stays one, and so does its end; elsewhere the reader would take "S" for a
    // sign.
    {"Stack", "{\\dn1234 \\\\S<0,100>}1/2{\\dn1234 \\\\s}"sv,
     "\\pard {\\dn1234 \\\\S<0,100>}1/2{\\dn1234 \\\\s"},
    {"StackOfAnEditor", "{\\dn1234 \\\\S}1/2;{\\dn6}a{\\dn6}"sv,
     "\\pard {\\dn1234 \\\\S}1/2;{\\dn6}a"},
    {"NoStack", "\\\\S\\tab\\\\Sa\\\\S\\{\\\\S{\\b b}"sv,
     "\\pard \\\\\\u83?\\tab \\\\Sa\\\\S\\{\\\\\\u83?{\\b b"},
    // The reader looks for words of paragraphs after the second backslash too.
    {"NoWords", "\\\\tx5\\\\parx\\\\x"sv, "\\pard \\\\\ntx5\\\\\nparx\\\\x"},
};
INSTANTIATE_TEST_SUITE_P(Groups, Bodies, testing::ValuesIn(kGroups), kName);

TEST(Tables, NameWhatIsUsed) {
    std::string const document =
        tzhost::normaliseRtf(
            "{\\rtf1{\\fonttbl{\\f3\\froman\\fprq2\\fcharset204 \\'c0\\u1041 ? ;}{\\f4 None;}}"
            "{\\colortbl\\red1;\\red255\\green128\\blue7;}\\f3\\cf1 a}")
            .document;
    EXPECT_EQ(document, "{\\rtf1\\ansi{\\fonttbl{\\f0\\froman\\fprq2\\fcharset204 \\'c0\\'c1 ;}}"
                        "{\\colortbl\\red255\\green128\\blue7;}\n\\pard {\\f0\\cf0 a\\par\n}}");
}

TEST(Dropped, IsCounted) {
    auto const result = tzhost::normaliseRtf(
        "{\\header h}{\\footerf f}{\\*\\shppict{\\pict 00}}{\\nonshppict{\\pict 00}}"
        "{\\shp{\\*\\shpinst x}{\\shprslt{\\*\\do y}}}"
        "{\\footnote n{\\footnote m}}{\\*\\annotation}");
    EXPECT_EQ(result.headers, 2);
    EXPECT_EQ(result.pictures, 2);
    EXPECT_EQ(result.notes, 2);
}

}  // namespace
