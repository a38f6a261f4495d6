// Rich text to markup: each word and escape and what it becomes, a row each.

#include <gtest/gtest.h>

#include "module/markup/read_rtf/rtf_tokens.h"
#include "tests/markup/conversions.h"

namespace {

using markuptest::kRowName;
using markuptest::MtextWriter;
using markuptest::Session;
using markuptest::shown;

struct WordCase {
    wchar_t const* text;  // after the backslash
    std::wstring_view word;
    int value;
    std::wstring_view rest;
};
constexpr WordCase kWords[] = {
    {L"par x", L"par", kNoValue, L"x"},
    {L"par  x", L"par", kNoValue, L" x"},
    {L"fs28x", L"fs", 28, L"x"},
    {L"fi-720 x", L"fi", -720, L"x"},
    {L"fi- x", L"fi", 0, L"x"},
    {L"fooBar", L"foo", kNoValue, L"Bar"},
    {L"b\u00E9", L"b", kNoValue, L"\u00E9"},
    {L"12x", L"", 12, L"x"},
    {L"'e9", L"", kNoValue, L"'e9"},
    {L" x", L"", kNoValue, L"x"},
    {L"", L"", kNoValue, L""},
    {L"b", L"b", kNoValue, L""},
    {L"f4294967297 x", L"f", 1, L"x"},
    {L"f-2147483648", L"f", kNoValue, L""},  // the number that stands for none
    {L"b0\n", L"b", 0, L"\n"},
};

TEST(Words, AreSplit) {
    for (WordCase const& row : kWords) {
        wchar_t const* cursor = row.text;
        int value = 5;
        EXPECT_EQ(readControlWord(cursor, value), row.word) << row.text;
        EXPECT_EQ(value, row.value) << row.text;
        EXPECT_EQ(std::wstring_view(cursor), row.rest) << row.text;
    }
}

TEST(Groups, AreSteppedOver) {
    struct Row {
        wchar_t const* text;
        std::wstring_view rest;
    };
    constexpr Row kRows[] = {
        {L"a}b", L"b"}, {L"a{b}c}d", L"d"}, {L"a\\}\\{\\\\}b", L"b"},
        {L"a", L""},    {L"a\\", L""},      {L"", L""},
    };
    for (Row const& row : kRows) {
        wchar_t const* cursor = row.text;
        skipGroupRest(cursor);
        EXPECT_EQ(std::wstring_view(cursor), row.rest) << row.text;
    }
}

struct RtfCase {
    char const* name;
    wchar_t const* rtf;
    wchar_t const* markup;
};

constexpr RtfCase kText[] = {
    {"Empty", L"", L""},
    {"Plain", L"{\\rtf1 A b}", L"A b"},
    {"NoHeader", L"A b", L"A b"},
    {"LineBreaks", L"{\\rtf1 a\r\nb\nc}", L"abc"},
    {"Tab", L"{\\rtf1 a\\tab b\tc}", L"a\tb\tc"},
    {"Line", L"a\\line b", L"a\nb"},
    {"Paragraph", L"a\\par b", L"a\\Pb"},
    {"ParagraphsAtTheEnd", L"a\\par\\par\\par }", L"a"},
    {"BackslashPAtTheEnd", L"a\\\\P", L"a\\"},
    {"Braces", L"\\{a\\}\\~\\-b", L"\\{a\\}\\~b"},
    {"SymbolsLoseTheirBackslash", L"a\\/b\\|c\\_d", L"a/b|c_d"},
    {"Hyphen", L"a\\-bc", L"abc"},
    {"HyphenTakesSymbol", L"a\\-{b}", L"a\\{b"},
    {"BlankTakesSymbol", L"a\\ {b}", L"a\\{b"},
    {"Backslash", L"a\\\\b", L"a\\\\b"},
    {"UnicodeCode", L"\\\\U+00E9\\\\u+4e2d", L"\\U+00E9\\u+4e2d"},
    {"MultibyteCode", L"\\\\M+182A0\\\\m+5b0a1", L"\\M+182A0\\m+5b0a1"},
    {"MultibyteOther", L"\\\\M+682A0", L"\\\\M+682A0"},
    {"Unicode", L"\\u233?\\u20013 x", L"\\U+00E9\\U+4E2D"},
    {"UnicodeNegative", L"\\u-3913?", L"\\U+FFFFF0B7"},
    {"UnicodeLarge", L"\\u128512?", L"\\U+1F600"},
    {"UnicodeEscaped", L"\\u233\\'e9x", L"\\U+00E9x"},
    {"UnicodeWithoutSubstitute", L"\\u233\\par x", L"\\U+00E9par x"},
    {"UnicodeAtTheEnd", L"\\u233", L"\\U+00E9"},
    {"UnicodeBare", L"\u00E9\u4E2D", L"\u00E9\u4E2D"},
    {"CountIsUnknown", L"a\\uc0\\u233?", L"a\\U+00E9"},
    {"Escape", L"\\'e9\\'93", L"\u00E9\u201C"},
    {"EscapeSplit", L"\\'\r\ne9x", L"\u00E9x"},
    {"EscapeCutOff", L"a\\'e", L"a\u00E0"},
    {"EscapeBadHex", L"\\'zz\\'g9", {L"\t"}},
    {"Page", L"\\ansicpg1251\\'c0\\cpg932\\'82\\'a0", L"\u0410\u3042"},
    {"PageSplit", L"\\ansicpg936\\'d6\r\n\\'\nd0", L"\u4E2D"},
    {"PageKorean", L"\\ansicpg949\\'b0\\'a1", L"\uAC00"},
    {"PageBig5", L"\\ansicpg950\\'a4\\'a4", L"\u4E2D"},
    {"PageUnknown", L"\\ansicpg4711\\'e9", L"\u00E9"},
    {"Spaces", L"a\\emspace b\\enspace c", L"a  b c"},
    {"LoneBackslash", L"a\\", L"a"},
    {"LoneBackslashEmits", L"a\\ul\\", L"a{\\L"},
    {"NumberAlone", L"a\\12xb", L"axb"},
    {"CapitalWord", L"a\\Bold", L"aBold"},
    {"EscapedBackslashIsACode", L"a\\'5cPb", L"a\\Pb"},
    {"UnicodeSubstitutePair", L"\\ansicpg932\\u12354\\'82\r\n\\'a0x", L"\\U+3042x"},
    {"KnownAndSilent", L"{\\rtf1{\\deff0 a}{\\lang1033 b}c}", L"abc"},
    {"Zero", L"a\\u0?", L"a\\U+0000"},
};

constexpr RtfCase kGroups[] = {
    {"Known", L"{\\rtf1{\\b0 a}b}", L"ab"},
    {"UnknownOpening", L"{\\rtf1 a{\\xyz b{c}\\}d}e}", L"ae"},
    {"UnknownBehindText", L"{\\rtf1 a{b\\xyz c}}", L"abc"},
    {"UnknownBehindWord", L"{\\rtf1{\\b0\\xyz c}}", L"c"},
    {"UnknownBehindGroup", L"{\\rtf1{{\\b0}\\xyz c}d}", L"d"},
    {"TextInInnerGroup", L"{\\rtf1{{a}\\xyz c}d}", L"acd"},
    {"EmptyGroupForgetsText", L"a{\\b0}\\xyz b", L"a"},
    {"Destination", L"{\\rtf1 a{\\*\\xyz b}c}", L"ac"},
    {"DestinationKnown", L"{\\rtf1{\\*\\b0 b}c}", L"bc"},
    {"DestinationLater", L"{\\rtf1{\\*\\b0 b\\xyz c}d}", L"bd"},
    {"DestinationOfOuter", L"{\\rtf1{\\*\\b0{a\\xyz b}c}d}", L"abcd"},
    {"DestinationBehindGroup", L"{\\rtf1{\\*\\b0{a}\\xyz b}c}", L"ac"},
    {"DestinationBehindText", L"{\\rtf1 a\\*\\xyz b}c", L"ac"},
    {"Empty", L"a{}{{}}b", L"ab"},
    {"StrayBrace", L"a}b", L"a"},
    {"BehindTheLastBrace", L"{\\rtf1 a}b", L"ab"},
    {"BehindTwoBraces", L"{\\rtf1 a}}b", L"a"},
    {"FontTableEatsItsBrace", L"{\\rtf1{\\fonttbl}a}b}c", L"abc"},
    {"ColorTableDoesNot", L"{\\rtf1{\\colortbl;}a}}c", L"a"},
    {"Open", L"{\\rtf1{{a", L"a"},
    {"OpenLook", L"{\\rtf1{\\ul a", L"{\\La}"},
};

constexpr RtfCase kLooks[] = {
    {"Underline", L"\\ul a\\ul0 b\\ulnone c\\ul1 d", L"{\\La}bc{\\Ld}"},
    {"Strike", L"\\strike a\\strike0 b", L"{\\Oa}b"},
    {"Collapse", L"\\ul\\ul0\\ul\\ul0 a", L"a"},
    {"GroupEndsLook", L"a{\\ul b}c", L"a{\\Lb}c"},
    {"OneBraceForAll", L"\\ul a\\strike b\\ul0 c\\strike0 d", L"{\\La\\Ob\\lc}d"},
    {"Bold", L"\\b a\\b0 b", L"{\\fLiberation Sans|b1|i0|c0|p34;a}b"},
    {"Italic", L"\\i a\\i0 b", L"{\\fLiberation Sans|b0|i1|c0|p34;a}b"},
    {"Size", L"\\fs56 a\\fs14 b\\fs28 c", L"{\\H2x;a\\H0.25x;b}c"},
    {"SizeBase", L"\\fs56\\fs0 a\\fs56\\fs b", L"ab"},
    {"SizeRounds", L"\\fs31 a", L"{\\H1.107x;a}"},
    {"Plain", L"\\ul\\b\\i\\strike\\fs56 a\\plain b",
     L"{\\fLiberation Sans|b1|i1|c0|p34;\\H2x;\\L\\Oa}b"},
    {"PlainColor", L"{\\colortbl\\red0\\green0\\blue255;}\\cf0 a\\plain b", L"{\\C5;a}b"},
    {"QuotesLeavePending", L"\\ul\\emspace a", L"  {\\La}"},
    {"TabIsACharacter", L"a\\ul\\tab\\ul0 b", L"a{\\L\t}b"},
    {"LineIsACharacter", L"a\\ul\\line\\ul0 b", L"a{\\L\n}b"},
    {"ParagraphIsACharacter", L"a\\ul\\par b", L"a{\\L\\Pb}"},
    {"Up", L"\\up6 a\\dn0 b\\dn c", L"abc"},  // seen only beside a stack
    {"Color", L"{\\colortbl\\red255\\green255\\blue255;\\red0\\green0\\blue255;}\\cf1 a\\cf0 b",
     L"{\\C5;a}b"},
    {"ColorTrue", L"{\\colortbl;\\red1\\green2\\blue200;}\\cf1 a", L"{\\C172;\\c13107713;a}"},
    {"ColorByLayer", L"{\\colortbl\\red255\\green0\\blue0;}\\cf0 a", L"{\\C256;a}"},
    {"ColorByBlock", L"{\\colortbl;}\\cf0 a", L"{\\C0;a}"},
    {"ColorUnknown", L"{\\colortbl;}\\cf9\\cf-1\\cf a", L"a"},
    {"ColorBlankIsAutomatic",
     L"{\\colortbl\\red0\\green0\\blue255;\\red1 ;\\red255 x;}\\cf1 a\\cf2 b",
     L"{\\C4;\\c16776961;a\\C5;b}"},
    {"ColorWideGreen", L"{\\colortbl\\red0\\green511\\blue0;}\\cf0 a", L"{\\C0;a}"},
    {"ColorWideOthers", L"{\\colortbl\\red511\\green0\\blue256;}\\cf0 a", L"{\\C256;a}"},
    {"ColorCutOff", L"{\\colortbl\\red0", L""},
    {"ColorGroupSkipped", L"{\\colortbl{\\red1;}\\red0\\green0\\blue255;}\\cf0 a", L"{\\C5;a}"},
};

constexpr RtfCase kFonts[] = {
    {"Mapped", L"{\\fonttbl{\\f3\\fmodern\\fprq1\\fcharset0 Plotter;}}\\f3 a", L"{\\Ftxt.shx|c0;a"},
    {"MappedOtherSet", L"{\\fonttbl{\\f3\\fswiss\\fprq2\\fcharset204 Simplex;}}\\f3 a",
     L"{\\Fromans.shx|c204;a"},
    {"Face", L"{\\fonttbl{\\f1\\froman\\fprq2\\fcharset238 Times New;}}\\f1 a",
     L"{\\fTimes New|b0|i0|c238|p18;a"},
    {"PageIsNotScoped", L"{\\fonttbl{\\f1\\fcharset204 A;}}{\\f1 \\'c0}\\'c0",
     L"{\\fA|b0|i0|c204|p0;\u0410}\u0410"},
    {"DefaultSet", L"{\\fonttbl{\\f1 Other;}}\\f1 a", L"{\\fOther|b0|i0|c0|p0;a"},
    {"DefaultSetIsUnmapped", L"{\\fonttbl{\\f3\\fmodern\\fprq1 Plotter;}}\\f3 a",
     L"{\\fPlotter|b0|i0|c0|p49;a"},
    {"Families", L"{\\fonttbl{\\f1\\fnil\\fdecor\\fprq2 D;}}\\f1 a", L"{\\fD|b0|i0|c0|p82;a"},
    {"Unknown", L"{\\fonttbl{\\f1 A;}}\\f2 a", L"a"},
    {"NoNumber", L"{\\fonttbl{A;}{\\f A;}}\\f0 a", L"a"},
    {"UnknownKeepsTheSet", L"{\\fonttbl{\\f1\\fcharset204 A;}}\\f1 a\\f9 b",
     L"{\\fA|b0|i0|c204|p0;a\\fLiberation Sans|b0|i0|c204|p0;b"},
    {"Script", L"{\\fonttbl{\\f1\\fscript S;}}\\f1 a", L"{\\fS|b0|i0|c0|p64;a"},
    {"Far", L"{\\fonttbl{\\f2000000000 A;}}\\f2000000000 a", L"{\\fA|b0|i0|c0|p0;a"},
    {"Negative", L"{\\fonttbl{\\f-2 A;}}\\f-2 a", L"a"},
    {"StrayCharacters", L"{\\fonttbl x;\\y{\\f1 A;}z}\\f1 a", L"{\\fA|b0|i0|c0|p0;a"},
    {"PageOfTheSet", L"{\\fonttbl{\\f1\\fcharset204 \\'c0\\'c1;}}\\f1 \\'c2",
     L"{\\f\u0410\u0411|b0|i0|c204|p0;\u0412"},
    {"WideName", L"{\\fonttbl{\\f1\\fcharset128 \\'82l\\'82\\'a0;}}\\f1 a",
     L"{\\f\uFF2D\u3042|b0|i0|c128|p0;a"},
    {"NameSplit", L"{\\fonttbl{\\f1 Ar\r\nial\n;}}\\f1 a", L"{\\fArial|b0|i0|c0|p0;a"},
    {"NameBackslash", L"{\\fonttbl{\\f1 A\\\\b;}}\\f1 a", L"{\\fA\\b|b0|i0|c0|p0;a"},
    {"Alternative", L"{\\fonttbl{\\f1 A{\\*\\falt B};}}\\f1 a", L"{\\fA|b0|i0|c0|p0;a"},
    {"Panose", L"{\\fonttbl{\\f1{\\*\\panose 020b}A;}}\\f1 a", L"{\\fA|b0|i0|c0|p0;a"},
    {"FullName", L"{\\fonttbl{\\f1{\\*\\fname B;}c;}}\\f1 a", L"{\\fB|b0|i0|c0|p0;a"},
    {"FullNameEscaped", L"{\\fonttbl{\\f1\\fcharset204{\\fname\\'c0}}}\\f1 a",
     L"{\\f\u0410|b0|i0|c204|p0;a"},
    {"FullNameBehindName", L"{\\fonttbl{\\f1 A{\\fname B};}}\\f1 a", L"{\\fA|b0|i0|c0|p0;a"},
    {"PanoseNested", L"{\\fonttbl{\\f1{\\*\\panose{x}2}A;}}\\f1 a", L"{\\fA|b0|i0|c0|p0;a"},
    {"FullNameStarred", L"{\\fonttbl{\\f1{\\fname\\*B;}}}\\f1 a", L"{\\fB|b0|i0|c0|p0;a"},
    {"LaterEntryWins", L"{\\fonttbl{\\f1 A;}{\\f1 B;}}\\f1 a", L"{\\fB|b0|i0|c0|p0;a"},
    {"EntryCutOff", L"{\\fonttbl{\\f1 A;", L""},
    {"NameWithoutEnd", L"{\\fonttbl{\\f1 A}{\\f2 B;}}\\f1 a", L""},
    {"SetsOfTheSystem", L"{\\fonttbl{\\f1\\fswiss\\fprq2\\fcharset0 LIBERATION SANS;}}\\f1 a",
     L"a"},
    {"Back", L"{\\fonttbl{\\f1 A;}}\\f1 a\\plain b",
     L"{\\fA|b0|i0|c0|p0;a\\fLiberation Sans|b0|i0|c0|p0;b"},
};

constexpr RtfCase kParagraphs[] = {
    {"Indents", L"\\pard\\fi-1008\\li2016 a", L"\\pi-1,l2;a"},
    {"Tabs", L"\\pard\\tx2016\\tx1008 a", L"\\pt1,2;a"},
    {"TabsGone", L"\\pard\\tx1008 a\\par\\pard b", L"\\pt1;a\\P\\ptz;b"},
    {"Same", L"\\pard\\li1008 a\\par\\pard\\li1008 b", L"\\pl1;a\\Pb"},
    {"WithoutReset", L"\\li1008 a", L""},
    {"BehindText", L"a\\li1008 b", L"ab"},
    {"AllToTheMark", L"\\pard a{\\b0\\li1008 b}\\fi1008 c\\par", L"\\pi1,l1;abc"},
    {"NotBeyond", L"\\pard a\\par\\li1008 b", L"a\\Pb"},
    {"LastCounts", L"\\pard\\li1\\li1008 a", L"\\pl1;a"},
    {"EscapedBackslashOpensWord", L"\\pard a\\\\li1008 b", L"\\pl1;a\\\\li1008 b"},
    {"EscapedPar", L"\\pard a\\\\par\\li1008 b", L"a\\\\parb"},
    {"Again", L"\\pard\\li1008\\pard\\fi1008 a", L"\\pi1,l1;\\pl0;a"},
    {"AgainTheOther", L"\\pard\\fi1008\\pard\\li1008 a", L"\\pi1,l1;\\pi0;a"},
    {"AgainTabs", L"\\pard\\tx1008\\pard\\tx2016 a", L"\\pt1,2;\\pt2;a"},
    {"AgainTabTwice", L"\\pard\\tx1008\\pard\\tx2016\\tx1008 a", L"\\pt1,2;a"},
    {"NotScoped", L"{\\pard\\li1008 a\\par}\\pard\\li1008 b", L"\\pl1;a\\Pb"},
    {"NoPending", L"\\ul\\pard\\li1008 a", L"\\pl1;{\\La}"},
    {"TabsInvalid", L"\\pard\\tx0\\tx-5\\tx a", L"a"},
};

constexpr RtfCase kStacks[] = {
    {"Marker", L"{\\dn1234 \\\\S<1,100>}1/2{\\dn1234 \\\\s}", L"\\S<1,100>1/2\\s"},
    {"BehindAStack", L"{\\dn1234 \\\\S<0,100>}1/2{\\dn1234 \\\\s}a\\\\Pb",
     L"\\S<0,100>1/2\\sa\\Pb"},
    {"EndedByDown", L"{\\dn1234 x}\\dn6 \\\\a", L"x\\\\a"},
    {"EndedByUp", L"{\\dn1234 x}\\up0 \\\\a", L"x\\\\a"},
    {"Literal", L"a\\\\S", L"a\\\\S"},
    {"SwallowsWords", L"\\\\S\\ul\\par a\\ul b", L"\\\\Sa{\\Lb}"},
    {"SwallowsUpToSymbol", L"\\\\S\\ul\\{\\ul a", L"\\\\S\\{{\\La}"},
    {"SwallowsBeyondGroup", L"{\\\\S}\\ul a", L"\\\\Sa"},
    {"SwallowsNoUnknown", L"a{\\\\S\\xyz b}", L"a\\\\Sb"},
    {"Alignment", L"\\up6\\\\S", L"\\A2;\\\\S"},
    {"AlignmentMiddle", L"\\up0\\\\S", L"\\A1;\\\\S"},
    {"AlignmentMissing", L"\\up\\\\S", L"\\A2;\\\\S"},
    {"AlignmentDown", L"\\up\\dn\\\\S", L"\\\\S"},
    {"AlignmentDownZero", L"\\dn0\\\\S", L"\\A1;\\\\S"},
    {"AlignmentOfMarker", L"\\up6\\dn1234 \\\\S", L"\\A2;\\S"},
    {"AlignmentOfOpenGroup", L"{\\up6\\\\S", L"\\\\S"},
    {"AlignmentOfGroup", L"{\\up6\\\\S}", L"\\\\S"},
};

constexpr RtfCase kLists[] = {
    {"Number", L"{\\pntext\\f9 1.\\tab}a", L"1.\ta"},
    {"Bullet", L"{\\pntext\\'b7\\tab}a", L"\u00B7\ta"},
    {"Groups", L"{\\pntext a{b}c}d", L"acd"},
    {"LineBreaks", L"{\\pntext a\r\nb}c", L"a\r\nbc"},
    {"Symbols", L"{\\pntext \\{1\\}}c", L"\\{1\\}c"},
    {"Unknown", L"{\\pntext\\xyz a}c", L"ac"},
    {"Nested", L"{\\pntext a\\pntext b}c", L"abc"},
    {"Look", L"{\\pntext\\ul a}c", L"{\\La}c"},
    {"CutOff", L"{\\pntext a\\", L"a"},
};

class Rtf : public testing::TestWithParam<RtfCase> {};

// Groups still open at the end of a row's text are closed after it.
TEST_P(Rtf, IsReadAs) {
    Session session;
    std::wstring text = session.toMtext(GetParam().rtf);
    std::wstring const expected = GetParam().markup;
    if (text.size() == expected.size() + 1 && text.back() == L'}') text.pop_back();
    EXPECT_EQ(shown(text), shown(expected));
}

INSTANTIATE_TEST_SUITE_P(Text, Rtf, testing::ValuesIn(kText), kRowName);
INSTANTIATE_TEST_SUITE_P(Groups, Rtf, testing::ValuesIn(kGroups), kRowName);
INSTANTIATE_TEST_SUITE_P(Looks, Rtf, testing::ValuesIn(kLooks), kRowName);
INSTANTIATE_TEST_SUITE_P(Fonts, Rtf, testing::ValuesIn(kFonts), kRowName);
INSTANTIATE_TEST_SUITE_P(Paragraphs, Rtf, testing::ValuesIn(kParagraphs), kRowName);
INSTANTIATE_TEST_SUITE_P(Stacks, Rtf, testing::ValuesIn(kStacks), kRowName);
INSTANTIATE_TEST_SUITE_P(Lists, Rtf, testing::ValuesIn(kLists), kRowName);

TEST(Defaults, StandAheadOfTheText) {
    MtextWriter writer;
    CRichTextToMTextContext& context = writer.context;
    markuptest::setUp(context);
    context.SetTracking(1.5);
    context.SetCharWidth(0.8);
    context.SetOblique(-15);
    context.SetBaseAlignment(kAlignMiddle, 0);
    context.SetOptions(CRichTextToMTextContext::kKeepTrailingParagraphs);
    EXPECT_STREQ(context.Parse(L"{\\rtf1\\ul\\\\S\\par\\par}").c_str(),
                 L"\\T1.5;\\W0.8;\\Q-15;\\A1;{\\L\\\\S}");
    MtextWriter other;
    CRichTextToMTextContext& kept = other.context;
    markuptest::setUp(kept);
    kept.SetBaseAlignment(kAlignMiddle, 0);
    kept.SetOptions(CRichTextToMTextContext::kKeepTrailingParagraphs);
    EXPECT_STREQ(kept.Parse(L"{\\rtf1 a\\par\\par}").c_str(), L"a\\P\\P");
}

TEST(Replacements, ComeFromTheResources) {
    Session session;
    EXPECT_EQ(shown(session.toMtext(L"a\\emdash b\\endash c\\lquote d\\rquote "
                                    L"e\\ldblquote f\\rdblquote")),
              "a\u2014b\u2013c\u2018d\u2019e\u201Cf\u201D");
}

TEST(InitialFont, MayBeAFile) {
    MtextWriter writer;
    CRichTextToMTextContext& context = writer.context;
    context.SetInitialFontFileName(L"slanted");
    EXPECT_STREQ(context.Parse(L"a\\b0 b\\i0\\f7 c").c_str(), L"a{\\fSlanted|b0|i1|c0|p18;b}c");
}

// The settings of the first document's paragraphs used to serve those of the second.
TEST(SecondDocument, BeginsAnewButForTheTextSoFar) {
    MtextWriter writer;
    markuptest::setUp(writer.context);
    constexpr wchar_t kBoth[] = L"\\pard\\li100 a\0\\pard\\li200 b";
    EXPECT_EQ(shown(writer.context.Parse(kBoth + 14)), "\\pl0.198413;b");
    EXPECT_EQ(shown(writer.context.Parse(kBoth)), "\\pl0.198413;b\\pl0.0992063;a");
}

}  // namespace
