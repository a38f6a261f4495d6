// Markup to rich text: each code and what it becomes, a row each.

#include <gtest/gtest.h>

#include "tests/markup/conversions.h"
#include "tz/mte/globals.h"

namespace {

using markuptest::bodyOf;
using markuptest::kRowName;
using markuptest::RtfWriter;
using markuptest::Session;
using markuptest::shown;

struct MarkupCase {
    char const* name;
    wchar_t const* markup;
    wchar_t const* body;
    unsigned int incidents;
};

// Rows worth a word: bits 7 to 15 alone tell what is escaped; no ";" is needed after a number; the
// colour of ByLayer is red here, as that of index 1.
constexpr MarkupCase kCharacters[] = {
    {"Empty", L"", L"", 0},
    {"Plain", L"A b;", L"A b;", 0},
    {"Latin", L"\u0080\u00FF", L"\\u128?\\u255?", 0},
    {"Wide", L"\u4E2Dx", L"\\u20013?x", 0},
    {"AboveBits", L"\U00010041", L"\U00010041", 0},
    {"AboveBmp", L"\U0001F600", L"\\u128512?", 0},
    {"LineFeed", L"a\nb", L"a\\line b", 0},
    {"Tab", L"a\tb", L"a\tb", 0},
    {"CarriageReturn", L"a\rb", L"a\rb", 0},
    {"Escapes", L"\\\\\\{\\}\\~", L"\\\\\\{\\}\\~", 0},
    {"Group", L"{a}b", L"{a}b", 0},
    {"StrayBrace", L"}a", L"}a", 0},
    {"OpenBrace", L"{a", L"{a", 0},
    {"Unicode", L"\\U+00e9\\u+4E2D", L"\\u233?\\u20013?", 0},
    {"UnicodeTakesFive", L"\\Uabcdefg", L"\\u0?fg", 0},
    {"UnicodeCutOff", L"a\\U+00", L"a\\u0?", 0},
    {"UnicodeAlone", L"a\\U", L"a\\u0?", 0},
    {"Multibyte", L"\\M+182A0x", L"\\\\M+182A0x", 0},
    {"MultibyteSmall", L"\\m+5b0a1", L"\\\\m+5b0a1", 0},
    {"MultibyteOther", L"\\M+6B0A1", L"\\\\M+6B0A1", kUnknownCode},
    {"MultibyteCutOff", L"\\M+182", L"\\\\M+182", kUnknownCode},
    {"UnknownLetters", L"\\K\\k\\N\\n\\X", L"\\\\K\\\\k\\\\N\\\\n\\\\X", kUnknownCode},
    {"UnknownSigns", L"\\1\\ \\|\\z\\?", L"\\\\1\\\\ \\\\|\\\\z\\\\?", kUnknownCode},
    {"UnknownLatin", L"\\\u00E9", L"\\\\\\'e9", kUnknownCode},
    {"UnknownWide", L"\\\u4E2D", L"\\\\\\'2d", kUnknownCode},
    {"LoneBackslash", L"a\\", L"a\\\\", kUnknownCode},
    {"Paragraph", L"a\\Pb", L"a\\par b", 0},
    {"Underline", L"\\La\\l", L"\\ul a\\ul0 ", 0},
    {"Overline", L"\\Oa\\o", L"\\strike a\\strike0 ", 0},
    {"UnknownAboveBits", L"\\\U00010041", L"\\\\\U00010041", kUnknownCode},
};

constexpr MarkupCase kLooks[] = {
    {"ColorIndex", L"\\C1;a\\C2b", L"\\cf1 a\\cf2 b", 0},
    {"ColorAgain", L"\\C1;\\C2;\\C1;", L"\\cf1 \\cf2 \\cf1 ", 0},
    {"ColorOfTheStart", L"\\C7;", L"\\cf0 ", 0},
    {"ColorByLayer", L"\\C256;\\C1;", L"\\cf1 \\cf1 ", 0},
    {"ColorByBlock", L"\\C0;\\C3;", L"\\cf1 \\cf1 ", 0},
    {"ColorNone", L"\\C;\\Cx", L"\\cf1 \\cf1 x", 0},
    {"ColorWraps", L"\\C4294967298;", L"\\cf1 ", 0},
    {"Rgb", L"\\c255;\\c4278190335;", L"\\cf1 \\cf1 ", 0},
    {"RgbNone", L"\\c;a\\cx", L"\\cf1 a\\cf1 x", 0},
    {"Height", L"\\H0.4;a\\H2xb", L"\\fs56 a\\fs112 b", 0},
    {"HeightRoundsUp", L"\\H0.2008;", L"\\fs29 ", 0},
    {"HeightInAGroup", L"{\\H0.4;\\La}b", L"{\\ul \\fs56 a}b", 0},
    {"HeightForEscape", L"{\\H0.4;\\\\}", L"{\\fs56 \\\\}", 0},
    {"HeightForUnicode", L"{\\H0.4;\\U+0041}", L"{\\fs56 \\u65?}", 0},
    {"HeightForUnknown", L"{\\H0.4;\\K}", L"{\\fs56 \\\\K}", kUnknownCode},
    {"HeightForBytes", L"{\\H0.4;\\M+182A0}", L"{\\fs56 \\\\M+182A0}", 0},
    {"HeightWaits", L"{\\H0.4;\\P\\C0;a}", L"{\\par \\cf1 \\fs56 a}", 0},
    {"HeightForBrace", L"{\\H0.4;}a", L"{\\fs56 }a", 0},
    {"HeightForFeed", L"{\\H0.4;\n}", L"{\\fs56 \\line }", 0},
    {"HeightOfAState", L"{\\H2x;a}\\H2x;b", L"{\\fs56 a}\\fs56 b", 0},
    {"HeightZero", L"\\H0;a\\Hx;b", L"ab", 0},
    {"HeightNegative", L"\\H-0.2;a", L"\\fs-27 a", 0},
    {"Face", L"\\fA|b1|i0|c204|p2;x", L"\\f1 \\b1 \\i0 x", kFaceWithoutFile},
    {"FaceKnown", L"\\fLiberation Sans|b1|i1|c0|p34;x", L"\\f0 \\b1 \\i1 x", 0},
    {"FaceOpen", L"\\fA;x", L"\\f1 \\b0 \\i0 ;x", kFaceWithoutFile},
    {"FaceOdd", L"\\fA|b2|iX|zz|c;x", L"\\f1 \\b0 \\i0 x", kFaceWithoutFile},
    {"FaceFlagTakesOne", L"\\fA|b;x;y", L"\\f1 \\b0 \\i0 y", kFaceWithoutFile},
    {"FaceCutOff", L"\\fA|b1", L"\\f1 \\b1 \\i0 ", kFaceWithoutFile},
    {"FaceTwice", L"\\fA|c1;\\fa|c1;\\fA|c2;", L"\\f1 \\b0 \\i0 \\f1 \\b0 \\i0 \\f2 \\b0 \\i0 ",
     kFaceWithoutFile},
    {"FaceOfTheMachine", L"\\fLiberation Sans|c204|p34;x", L"\\f0 \\b0 \\i0 x", 0},
    {"FaceDigits", L"\\fA|c1;\\fA|c00000000000000010;", L"\\f1 \\b0 \\i0 \\f1 \\b0 \\i0 ",
     kFaceWithoutFile},
    {"FaceMapped", L"\\fPlotter|b0|i0|c0|p49;x", L"\\f1 \\b0 \\i0 x", 0},
    {"File", L"\\Fromans;x\\FROMANS.SHX|c0;y", L"\\f1 \\b0 \\i0 x\\f2 \\b0 \\i0 y", 0},
    {"FileFolder", L"\\Fc:\\fonts\\slanted.shx;x", L"\\f1 \\b1 \\i1 x", 0},
    {"FileLent", L"\\Fnone;x", L"\\f1 \\b0 \\i0 x", kFontByProxy},
    {"FileLentAgain", L"\\Fn|c0;\\Fo;\\Fn;", L"\\f1 \\b0 \\i0 \\f2 \\b0 \\i0 \\f1 \\b0 \\i0 ",
     kFontByProxy},
    {"FileBehindTheGap", L"\\Fn;\\Fo;\\Fp;\\Fp;",
     L"\\f1 \\b0 \\i0 \\f2 \\b0 \\i0 \\f3 \\b0 \\i0 \\f4 \\b0 \\i0 ", kFontByProxy},
    {"FilePair", L"\\Ftxt,big;x", L"\\f1 \\b0 \\i0 x", kFontByProxy},
    {"FileOdd", L"\\Ftxt|xc204y;z", L"\\f1 \\b0 \\i0 z", 0},
    {"FileCutOff", L"a\\Ftxt", L"a\\f1 \\b0 \\i0 ", 0},
    {"FileOfTheService", L"\\FDejaVuSans-Bold.ttf;x", L"\\f1 \\b1 \\i0 x", 0},
};

constexpr MarkupCase kParagraphs[] = {
    {"Indents", L"\\pi-2,l3;x", L"\\fi-2016 \\li3024 x", 0},
    {"IndentSame", L"\\pi1;\\pi1;x", L"\\fi1008 x", 0},
    {"IndentAndBack", L"\\pi1;\\pi0;x", L"\\fi1008 \\fi0 x", 0},
    {"IndentMinusZero", L"\\pi-0;x", L"x", 0},
    {"Tabs", L"\\pt4,2,2,8;x", L"\\pard \\fi0 \\li0 \\tx2016 \\tx4032 \\tx8064 x", 0},
    {"TabsSame", L"\\pt4;\\pt4;x", L"\\pard \\fi0 \\li0 \\tx4032 x", 0},
    {"TabsCleared", L"\\pt4;\\ptz;x", L"\\pard \\fi0 \\li0 \\tx4032 \\pard \\fi0 \\li0 x", 0},
    {"TabsClearedEmpty", L"\\pt4;\\pt;x", L"\\pard \\fi0 \\li0 \\tx4032 \\pard \\fi0 \\li0 x", 0},
    {"TabsClearedFirst", L"\\ptz,i2;x", L",i2;x", 0},
    {"TabsNone", L"\\ptz;x", L"x", 0},
    {"TabsBelowOne", L"\\pt0,-3,1;x", L"\\pard \\fi0 \\li0 \\tx1008 x", 0},
    {"TabsThenIndent", L"\\pt1,i2;x", L"\\pard \\fi2016 \\li0 \\tx1008 x", 0},
    {"Relative", L"\\pi1x,l2;x", L"\\fi1008 \\li2016 x", 0},
    {"Unknown", L"\\pxyz;", L"xyz;", 0},
    {"StopsAtUnknown", L"\\pi1,q2;x", L"\\fi1008 q2;x", 0},
    {"StopsAtBackslash", L"\\pl2\\Lx", L"\\li2016 \\ul x", 0},
    {"CutOff", L"\\pi1,t2", L"\\pard \\fi1008 \\li0 \\tx2016 ", 0},
    {"NoComma", L"\\pi1l2;x", L"\\fi1008 \\li2016 x", 0},
    {"OutliveGroup", L"{\\pl2;a}b", L"{\\li2016 a}\\li2016 b", 0},
    {"OutliveTwoGroups", L"{{\\pt2;a}}b",
     L"{{\\pard \\fi0 \\li0 \\tx2016 a}\\pard \\fi0 \\li0 \\tx2016 }\\pard \\fi0 \\li0 \\tx2016 b",
     0},
    {"KeptInGroup", L"\\pl2;{a}b", L"\\li2016 {a}b", 0},
};

constexpr MarkupCase kStacks[] = {
    {"Over", L"\\S1/2;", L"{\\dn1234 \\\\S<0,100>}1/2{\\dn1234 \\\\s}", 0},
    {"Fraction", L"\\S1#2;x", L"{\\dn1234 \\\\S<0,100>}1#2{\\dn1234 \\\\s}x", 0},
    {"Tolerance", L"\\S^2;", L"{\\dn1234 \\\\S<0,100>}^2{\\dn1234 \\\\s}", 0},
    {"Aligned", L"\\A1;\\S1/2;", L"{\\dn1234 \\\\S<1,100>}1/2{\\dn1234 \\\\s}", 0},
    {"BadAlignment", L"\\A2;\\A3;\\S1/2;", L"{\\dn1234 \\\\S<2,100>}1/2{\\dn1234 \\\\s}", 0},
    {"InAGroup", L"{\\H.7x;\\S1/2;a}", L"{{\\dn1234 \\\\S<0,70>}1/2{\\dn1234 \\\\s}\\fs20 a}", 0},
    {"AbsoluteInAGroup", L"{\\H.7;\\S1/2;}", L"{{\\dn1234 \\\\S<0,100>}1/2{\\dn1234 \\\\s}\\fs98 }",
     0},
    {"AbsoluteForgets", L"{\\H3x;\\H.7;\\S1/2;}",
     L"{{\\dn1234 \\\\S<0,100>}1/2{\\dn1234 \\\\s}\\fs98 }", 0},
    {"PercentTruncates", L"{\\H.58x;\\S1/2;a}",
     L"{{\\dn1234 \\\\S<0,57>}1/2{\\dn1234 \\\\s}\\fs17 a}", 0},
    {"NotInAGroup", L"\\H.7x;\\S1/2;", L"\\fs20 {\\dn1234 \\\\S<0,100>}1/2{\\dn1234 \\\\s}", 0},
    {"Unicode", L"\\S\\U+00e9/\\u+00E9;", L"{\\dn1234 \\\\S<0,100>}\\u233?/\\u233?{\\dn1234 \\\\s}",
     0},
    {"Bare", L"\\S\u00e9/b;", L"{\\dn1234 \\\\S<0,100>}\u00e9/b{\\dn1234 \\\\s}", 0},
    {"EscapedSign", L"\\S1\\/2;", L"{\\dn1234 \\\\S<0,100>}1\\/2{\\dn1234 \\\\s}", 0},
    {"EscapeHides", L"\\S\\;;x/y;", L"{\\dn1234 \\\\S<0,100>}\\;;x/y{\\dn1234 \\\\s}", 0},
    {"LetterOfTheList", L"\\Sabz;", L"{\\dn1234 \\\\S<0,100>}abz{\\dn1234 \\\\s}", 0},
    {"CutOff", L"\\S1/2", L"{\\dn1234 \\\\S<0,100>}1/2{\\dn1234 \\\\s}", 0},
    {"CutOffEscape", L"\\S1/2\\", L"{\\dn1234 \\\\S<0,100>}1/2\\{\\dn1234 \\\\s}", 0},
    {"CodeCutOff", L"\\S/\\U+00;", L"{\\dn1234 \\\\S<0,100>}/\\u0?{\\dn1234 \\\\s}", 0},
    {"NoSign", L"\\Sabc;d", L"\\\\Sabc;d", kStackWithoutSign},
    {"NoSignAtAll", L"\\S", L"\\\\S", kStackWithoutSign},
    {"SignBehind", L"\\Sab;/", L"\\\\Sab;/", kStackWithoutSign},
    {"SignInACode", L"\\S\\U+002F;", L"\\\\S\\u47?;", kStackWithoutSign},
    {"CodeHidesSign", L"\\S\\Uaa/aax;", L"\\\\S\\u0?x;", kStackWithoutSign},
    {"ReadAgain", L"\\Sx\\Ly;", L"\\\\Sx\\ul y;", kStackWithoutSign},
};

class Markup : public testing::TestWithParam<MarkupCase> {};

TEST_P(Markup, IsWrittenAs) {
    RtfWriter writer;
    CMTextToRichTextContext& context = writer.context;
    markuptest::setUp(context);
    EXPECT_EQ(shown(bodyOf(context.Parse(GetParam().markup))), shown(GetParam().body));
    EXPECT_EQ(context.GetIncidents(), GetParam().incidents);
}

INSTANTIATE_TEST_SUITE_P(Characters, Markup, testing::ValuesIn(kCharacters), kRowName);
INSTANTIATE_TEST_SUITE_P(Looks, Markup, testing::ValuesIn(kLooks), kRowName);
INSTANTIATE_TEST_SUITE_P(Paragraphs, Markup, testing::ValuesIn(kParagraphs), kRowName);
INSTANTIATE_TEST_SUITE_P(Stacks, Markup, testing::ValuesIn(kStacks), kRowName);

TEST(Document, HasItsTablesAndHead) {
    Session session;
    EXPECT_EQ(shown(session.toRtf(L"{\\C1;\\Fslanted|c2;\u00E9}")),
              "{\\rtf1\\ansi{\\fonttbl{\\f0\\fswiss\\fprq2\\fcharset0 Liberation Sans;}"
              "{\\f1\\froman\\fprq2\\fcharset2 Slanted;}}\r\n"
              "{\\colortbl\\red255\\green255\\blue255;\\red255\\green0\\blue0;}\r\n"
              "\\pard\\plain\\f0\\cf0\\fs28 \\deftab0 {\\cf1 \\f1 \\b1 \\i1 \\u233?}\\par }");
}

TEST(Document, BeginsWithTheInitialFont) {
    RtfWriter writer;
    CMTextToRichTextContext& context = writer.context;
    context.SetInitialFontFileName(L"slanted");
    context.SetInitialFontSize(0.0, 319);
    context.SetInitialFontColor(0);
    EXPECT_EQ(context.EffectiveSize(), 2.0);
    EXPECT_EQ(shown(context.Parse(L"x")),
              "{\\rtf1\\ansi{\\fonttbl{\\f0\\froman\\fprq2\\fcharset0 Slanted;}}\r\n"
              "{\\colortbl\\red0\\green0\\blue0;}\r\n"
              "\\pard\\plain\\f0\\cf0\\fs31\\b\\i \\deftab0 x\\par }");
    EXPECT_STREQ(context.Font().c_str(), L"Slanted");  // the face, once it has a file
    EXPECT_EQ(context.PitchAndFamily(), 18);
    EXPECT_EQ(g_sInitialFont, L"Slanted");
    RtfWriter ofTheMachine;
    ofTheMachine.context.SetInitialFontFileName(L"DejaVuSans-Bold.ttf");
    EXPECT_STREQ(ofTheMachine.context.Font().c_str(), L"DejaVuSans-Bold.ttf");
    EXPECT_TRUE(g_sInitialFont.isEmpty());  // a font that the map does not know
    RtfWriter other;
    CMTextToRichTextContext& lent = other.context;
    lent.SetInitialFontFileName(L"none");
    EXPECT_TRUE(lent.IsIncident(kFontByProxy));
    EXPECT_STREQ(lent.Font().c_str(), L"Lent One");
}

struct WholeTextCase {
    char const* name;
    wchar_t const* markup;
    double tracking, width, oblique;
    unsigned int incidents;
};
constexpr WholeTextCase kWholeTexts[] = {
    {"Ahead", L"\\T2;\\W.8;\\Q15;a", 2, 0.8, 15, 0},
    {"Late", L"a\\T2;\\W.8;\\Q15;", 2, 0.8, 15, kTrackingLate | kCharWidthLate | kObliqueLate},
    {"Twice", L"\\T2;\\T3;\\W2;\\W3;\\Q2;\\Q3;", 2, 2, 2,
     kTrackingIgnored | kCharWidthIgnored | kObliqueIgnored},
    {"Default", L"\\T1;\\T3;\\W1;\\W3;\\Q0;\\Q3;", 3, 3, 3, 0},
    {"LateDefault", L"a\\T1;\\T3;", 1, 1, 0, kTrackingLate | kTrackingIgnored},
    {"ZeroTracking", L"\\T0;\\T3;\\W0;\\W3;", 3, 0, 0, kCharWidthIgnored},
    {"BracesCount", L"{}\\T2;", 2, 1, 0, kTrackingLate},
    {"FeedsCount", L"\n\\W2;", 1, 2, 0, kCharWidthLate},
    {"CodesDoNot", L"\\P\\U+0041\\\\\\T2;", 2, 1, 0, 0},
    {"InAGroup", L"{\\Q-15;}", 1, 1, -15, kObliqueLate},
};

TEST(WholeTextValues, CountOnce) {
    for (WholeTextCase const& row : kWholeTexts) {
        RtfWriter writer;
        CMTextToRichTextContext& context = writer.context;
        markuptest::setUp(context);
        (void)context.Parse(row.markup);
        EXPECT_EQ(context.GetTracking(), row.tracking) << row.name;
        EXPECT_EQ(context.GetCharWidth(), row.width) << row.name;
        EXPECT_EQ(context.GetOblique(), row.oblique) << row.name;
        EXPECT_EQ(context.GetIncidents(), row.incidents) << row.name;
    }
}

TEST(Sizes, AreTracked) {
    struct Row {
        wchar_t const* markup;
        int twips, initial, current, least, most;
    };
    constexpr Row kRows[] = {
        {L"a", 280, 28, 28, 28, 28},
        {L"a", 200, 20, 20, 20, 28},  // the first 28 is never forgotten
        {L"\\H.4;\\H.1;a", 280, 28, 14, 14, 56},
        {L"{\\H.4;}a", 320, 32, 56, 28, 56},
    };
    for (Row const& row : kRows) {
        RtfWriter writer;
        CMTextToRichTextContext& context = writer.context;
        context.SetInitialFontSize(0.2, row.twips);
        (void)context.Parse(row.markup);
        EXPECT_EQ(context.GetInitialFontSize(), row.initial) << row.markup;
        EXPECT_EQ(context.GetCurrentFontSize(), row.current) << row.markup;
        EXPECT_EQ(context.GetMinFontSize(), row.least) << row.markup;
        EXPECT_EQ(context.GetMaxFontSize(), row.most) << row.markup;
    }
}

TEST(States, AreThirtyTwoAtMost) {
    RtfWriter writer;
    CMTextToRichTextContext& context = writer.context;
    markuptest::setUp(context);
    // 33 groups open, 31 of them push; after 31 braces, not after 30, the outermost state is in
    // force, so that a height is written at once.
    std::wstring const text =
        std::wstring(33, L'{') + std::wstring(30, L'}') + L"\\H.4;\\L}\\H.2;\\L}}";
    EXPECT_EQ(shown(bodyOf(context.Parse(text.c_str()))),
              std::string(33, '{') + std::string(30, '}') + "\\ul \\fs56 }\\fs28 \\ul }}");
    EXPECT_EQ(context.States(), 1);
    context.ResetState();
    EXPECT_EQ(context.EffectiveSize(), 1.0);
}

TEST(States, TakeTheFontOfACode) {
    struct Row {
        wchar_t const* markup;
        wchar_t const* font;
        int charset, pitch;
    };
    constexpr Row kRows[] = {
        {L"\\Fslanted.shx|c2;", L"Slanted", 2, 18},
        {L"\\fA\\b|c204|p2;", L"A\\\\b", 204, 2},  // as the document has it
        {L"\\fA|p2;", L"A", 1, 2},
        {L"{\\fA|c204|p2;}\\L", L"", 0, 0},
    };
    for (Row const& row : kRows) {
        RtfWriter writer;
        markuptest::setUp(writer.context);
        (void)writer.context.Parse(row.markup);
        EXPECT_STREQ(writer.context.Font().c_str(), row.font) << row.markup;
        EXPECT_EQ(writer.context.CharSet(), row.charset) << row.markup;
        EXPECT_EQ(writer.context.PitchAndFamily(), row.pitch) << row.markup;
    }
}

TEST(Tabs, KeepTheFirstThirtyTwo) {
    Session session;
    std::wstring markup = L"\\pt";
    std::string body = "\\pard \\fi0 \\li0 ";
    CScaleCorrection scale(0);
    scale.SetScaleUnits(markuptest::kSize);
    scale.SetScaleTwips(markuptest::kTwips);
    for (int i = 40; i > 0; --i)
        markup += std::to_wstring(i) + (i > 1 ? L"," : L";");
    for (int i = 9; i <= 40; ++i)
        body += "\\tx" + std::to_string(scale.ScaleUnitsToTwips(i * 0.72)) + " ";
    EXPECT_EQ(shown(bodyOf(session.toRtf(markup))), body);
}

TEST(Text, EndsAtAZeroCharacter) {
    Session session;
    EXPECT_EQ(bodyOf(session.toRtf(std::wstring(L"a\0b", 3))), L"a");
}

TEST(Alignment, OfTheSystemIsKeptByAnEmptyTextAlone) {
    RtfWriter empty;
    (void)empty.context.Parse(L"");
    EXPECT_EQ(empty.context.GetBaseAlignment(), kAlignMiddle);
    RtfWriter full;
    (void)full.context.Parse(L"x");
    EXPECT_EQ(full.context.GetBaseAlignment(), kAlignBottom);
}

// The second code of the file used to come to the face of the machine again.
TEST(Fonts, AreLookedUpAgainOnceAProxyIsLent) {
    Session session;
    EXPECT_EQ(shown(bodyOf(session.toRtf(L"\\FDejaVuSans.ttf|c0;a\\FDejaVuSans.ttf.shx|c0;b"
                                         L"\\FDejaVuSans.ttf|c0;c"))),
              "\\f1 \\b0 \\i0 a\\f2 \\b0 \\i0 b\\f2 \\b0 \\i0 c");
}

// What the first text taught used to serve the second: "late" tracking, the end of a stack, and a
// face that had a file.
TEST(SecondText, BeginsAnewButForTablesAndTheTextSoFar) {
    RtfWriter writer;
    CMTextToRichTextContext& context = writer.context;
    markuptest::setUp(context);
    writer.fonts().AddProxy(L"none.shx");
    EXPECT_EQ(shown(bodyOf(context.Parse(L"\\fLent One|c0;ab\\S/"))),
              "\\f1 \\b0 \\i0 ab{\\dn1234 \\\\S<0,100>}/{\\dn1234 \\\\s}");
    EXPECT_EQ(context.GetIncidents(), 0U);
    { CMTextFontMapDatabase const other(0); }  // takes the proxies away
    EXPECT_EQ(shown(bodyOf(context.Parse(L"\\T2;\\fLent One|c0;\\Sab"))),
              "\\f1 \\b0 \\i0 ab{\\dn1234 \\\\S<0,100>}/{\\dn1234 \\\\s}\\par \\deftab0 "
              "\\f1 \\b0 \\i0 \\\\Sab");
    EXPECT_EQ(context.GetIncidents(), kFaceWithoutFile | kStackWithoutSign);
}

}  // namespace
