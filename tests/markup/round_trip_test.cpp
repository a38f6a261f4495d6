// Markup to rich text and back: what a trip rewrites, and that a second one rewrites no more.

#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include <cstdlib>

#include <gtest/gtest.h>

#include "tests/markup/conversions.h"

namespace {

using markuptest::Session;
using markuptest::shown;

struct TripCase {
    char const* name;
    wchar_t const* markup;
    wchar_t const* first;
    wchar_t const* second = nullptr;  // of a further trip; null when that changes nothing more
};
constexpr TripCase kTrips[] = {
    {"Text", L"A b\\Pc\td\ne\\~\\{\\}\\\\f", L"A b\\Pc\td\ne\\~\\{\\}\\\\f"},
    {"ParagraphsAtTheEnd", L"A\\P\\P\\P", L"A"},
    {"WideTurnsToCodes", L"\u00E9\u4E2D\\U+00e9", L"\\U+00E9\\U+4E2D\\U+00E9"},
    {"Multibyte", L"\\M+182A0", L"\\M+182A0"},
    {"UnknownTurnsLiteral", L"\\Ka", L"\\\\Ka"},
    {"Underline", L"\\La\\lb", L"{\\La}b"},
    {"GroupsMerge", L"{\\L{\\Oa}b}c", L"{\\L\\Oa\\ob}c"},
    {"OpenGroup", L"{\\La", L"{\\La}"},
    {"HeightsAreFactors", L"\\H0.5;a\\H2x;b", L"{\\H2.5x;a\\H2x;b}"},
    {"HeightComesBackExact", L"{\\H3x;a}\\H1x;b", L"{\\H3x;a}b"},
    {"FileFont", L"{\\Fromans.shx|c204;a}b", L"{\\Fromans.shx|c204;a}b"},
    {"FileFontWithoutSet", L"{\\Ftxt;a}b", L"{\\Ftxt.shx|c0;a}b"},
    {"FontLent", L"{\\Fnone.shx|c0;a}b", L"{\\Fnone.shx|c0;a}b"},
    {"FontPair", L"{\\Ftxt,big|c0;a}b", L"{\\Ftxt.shx,big.shx|c0;a}b"},
    // Each code of a pair lends the face anew: the last was "qc.shx,qd.shx".
    {"FontPairsInTurns", L"\\Fqa,qb|c0;x\\Fqc,qd|c0;y\\Fqa,qb|c0;z", L"{\\Fqa.shx,qb.shx|c0;xyz}"},
    {"FaceFont", L"{\\fOther|b1|i0|c238|p18;a}b", L"{\\fOther|b1|i0|c238|p18;a}b"},
    {"FaceWithBackslash", L"{\\fA\\b|b0|i0|c0|p0;a}b", L"{\\fA\\b|b0|i0|c0|p0;a}b"},
    {"FaceFontWithoutFields", L"{\\fOther;a}b", L"{\\fOther|b0|i0|c0|p0;;a}b"},
    {"Color", L"{\\C5;a}{\\C256;b}{\\C0;c}", L"{\\C5;a\\C256;b\\C0;c}"},
    {"TrueColor", L"{\\c13107713;a}b", L"{\\C172;\\c13107713;a}b"},
    {"Indents", L"\\pi-1,l2,t3,4;a", L"\\pi-1,l2,t3,4;a"},
    {"IndentsInAGroup", L"a{\\pt2;b}c", L"\\pt2;abc"},
    {"IndentsWithoutTabs", L"a\\Pb\\pl2;c", L"a\\Pbc"},
    {"Values", L"\\T1.5;\\W0.8;\\Q15;a", L"\\T1.5;\\W0.8;\\Q15;a"},
    {"ValuesMidText", L"a\\T1.5;b\\T2;c", L"\\T1.5;abc"},
    {"Alignment", L"\\A1;a", L"a"},
    {"Stack", L"a\\S1/2;b", L"a\\S<0,100>1/2\\sb", L"a\\S<0,100><0,100>1/2\\s"},
    {"StackAligned", L"\\A1;\\S1/2;", L"\\A1;\\S<1,100>1/2\\s", L"\\A1;\\S<1,100><1,100>1/2\\s"},
    {"BackslashBehindStack", L"\\S1/2;\\\\P", L"\\S<0,100>1/2\\s", L"\\S<0,100><0,100>1/2\\s"},
    {"StackWithoutSign", L"\\Sab;", L"\\\\Sab;"},
    {"StacksTwice", L"\\S1/2; \\S3#4;", L"\\S<0,100>1/2\\s \\S<0,100>3#4\\s",
     L"\\S<0,100><0,100>1/2S<0,100>3#4\\s"},
    {"StackInAGroup", L"{\\H.7x;\\S+1^-2;}x", L"\\S<0,70>+1^-2\\sx", L"\\S<0,100><0,70>+1^-2\\s"},
    {"StackWide", L"\\S\u00E9/b;", L"\\S<0,100>\u00E9/b\\s", L"\\S<0,100><0,100>\u00E9/b\\s"},
    {"EscapesBehindStack", L"\\S1/2;\\{a\\\\b\\}", L"\\S<0,100>1/2\\s\\{a\\b\\}",
     L"\\S<0,100><0,100>1/2\\{a{\\fLiberation Sans|b1|i0|c0|p34;\\}\\s}"},
    {"HeightInFourDigits", L"{\\H0.33333x;a}b", L"{\\H0.3333x;a}b"},
    {"IndentDigits", L"\\pi1.23456789;a", L"\\pi1.23457;a"},
    {"IndentInExponent", L"\\pi1000000;a", L"\\pi1e+06;a", L"\\pi1;e+06;a"},
    {"ValueInExponent", L"\\T0.00001;a", L"\\T1e-05;a", L"e-05;a"},
    {"LiteralPAtTheEnd", L"a\\\\P", L"a\\", L"a\\\\"},
    {"LineBreaks", L"a\n\nb\\P\\Pc", L"a\n\nb\\P\\Pc"},
    // The group opens with a word that the reader does not know, which drops its text too.
    {"IndentsAtAGroup", L"a\\P{\\pl2;b}\\Pc", L"a\\P\\Pc"},
    {"AlignmentsMidText", L"\\A1;a\\A2;b", L"ab"},
    {"ByteTurnsToCode", L"\u0080\u00FF", L"\\U+0080\\U+00FF"},
    {"ColorInBase", L"a{\\C256;b}", L"a{\\C256;b}"},
    {"Fields", L"%<\\\\Date>% \\U+0025<", L"%<\\\\Date>% \\U+0025<"},
};

constexpr std::size_t kLongestMarker = 7;  // what a trip puts after a stack's "\\S": <2,100>

// The first two trips are as expected, the reader knows the words of the first, which used to be
// counted as unknown from "ansi" on, and each of a few more trips adds at most a marker a stack.
void expectTrips(std::wstring const& markup,
                 std::wstring const& first,
                 std::wstring const& second) {
    Session session;
    std::wstring text = session.roundTrip(markup);
    EXPECT_EQ(shown(text), shown(first)) << shown(markup);
    RtfLosses::Kind const& unknown = session.losses().unknownWords;
    EXPECT_EQ(unknown.count, 0) << shown(unknown.first) << shown(markup);
    text = session.roundTrip(text);
    EXPECT_EQ(shown(text), shown(second)) << shown(markup);
    std::size_t stacks = 0;
    for (std::size_t at = markup.find(L"\\S"); at != markup.npos; at = markup.find(L"\\S", at + 2))
        ++stacks;
    for (int trip = 3; trip < 8; ++trip) {
        std::size_t const before = text.size();
        text = session.roundTrip(text);
        EXPECT_LE(text.size(), before + stacks * kLongestMarker) << shown(markup) << trip;
    }
}

TEST(RoundTrip, RewritesAs) {
    for (TripCase const& row : kTrips) {
        SCOPED_TRACE(row.name);
        expectTrips(row.markup, row.first, row.second ? row.second : row.first);
    }
}

// The texts of a drafting office: each three lines, what it is, what it becomes, and what that
// becomes; a third line of "=" says that a second trip changes nothing.
struct OfficeText {
    std::string markup, first, second;
};

std::vector<OfficeText> officeTexts() {
    std::ifstream file(std::string(std::getenv("TZ_TEST_SOURCE")) + "/tests/markup/office.txt");
    std::vector<OfficeText> texts;
    std::string line;
    std::vector<std::string> lines;
    while (std::getline(file, line)) {
        if (line.empty() || line[0] == ';') continue;
        lines.push_back(line);
        if (lines.size() < 3) continue;
        texts.push_back({lines[0], lines[1], lines[2] == "=" ? lines[1] : lines[2]});
        lines.clear();
    }
    return texts;
}

TEST(RoundTrip, KeepsOfficeTexts) {
    std::vector<OfficeText> const texts = officeTexts();
    EXPECT_GE(texts.size(), 8U);
    for (OfficeText const& text : texts) {
        expectTrips(TzString::fromUtf8(text.markup).str(), TzString::fromUtf8(text.first).str(),
                    TzString::fromUtf8(text.second).str());
    }
}

}  // namespace
