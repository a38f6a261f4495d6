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
    wchar_t const* result;
};
constexpr TripCase kTrips[] = {
    {"Text",                  L"A b\\Pc\td\ne\\~\\{\\}\\\\f",  L"A b\\Pc\td\ne\\~\\{\\}\\\\f" },
    {"ParagraphsAtTheEnd",    L"A\\P\\P\\P",                   L"A"                           },
    {"WideTurnsToCodes",      L"\u00E9\u4E2D\\U+00e9",         L"\\U+00E9\\U+4E2D\\U+00E9"    },
    {"Multibyte",             L"\\M+182A0",                    L"\\M+182A0"                   },
    {"UnknownTurnsLiteral",   L"\\Ka",                         L"\\\\Ka"                      },
    {"Underline",             L"\\La\\lb",                     L"{\\La}b"                     },
    {"GroupsMerge",           L"{\\L{\\Oa}b}c",                L"{\\L\\Oa\\ob}c"              },
    {"OpenGroup",             L"{\\La",                        L"{\\La}"                      },
    {"HeightsAreFactors",     L"\\H0.5;a\\H2x;b",              L"{\\H2.5x;a\\H2x;b}"          },
    {"HeightComesBackExact",  L"{\\H3x;a}\\H1x;b",             L"{\\H3x;a}b"                  },
    {"FileFont",              L"{\\Fromans.shx|c204;a}b",      L"{\\Fromans.shx|c204;a}b"     },
    {"FileFontWithoutSet",    L"{\\Ftxt;a}b",                  L"{\\Ftxt.shx|c0;a}b"          },
    {"FontLent",              L"{\\Fnone.shx|c0;a}b",          L"{\\Fnone.shx|c0;a}b"         },
    {"FontPair",              L"{\\Ftxt,big|c0;a}b",           L"{\\Ftxt.shx,big.shx|c0;a}b"  },
    {"FaceFont",              L"{\\fOther|b1|i0|c238|p18;a}b", L"{\\fOther|b1|i0|c238|p18;a}b"},
    {"FaceFontWithoutFields", L"{\\fOther;a}b",                L"{\\fOther|b0|i0|c0|p0;;a}b"  },
    {"Color",                 L"{\\C5;a}{\\C256;b}{\\C0;c}",   L"{\\C5;a\\C256;b\\C0;c}"      },
    {"TrueColor",             L"{\\c13107713;a}b",             L"{\\C172;\\c13107713;a}b"     },
    {"Indents",               L"\\pi-1,l2,t3,4;a",             L"\\pi-1,l2,t3,4;a"            },
    {"IndentsInAGroup",       L"a{\\pt2;b}c",                  L"\\pt2;abc"                   },
    {"IndentsWithoutTabs",    L"a\\Pb\\pl2;c",                 L"a\\Pbc"                      },
    {"Values",                L"\\T1.5;\\W0.8;\\Q15;a",        L"\\T1.5;\\W0.8;\\Q15;a"       },
    {"ValuesMidText",         L"a\\T1.5;b\\T2;c",              L"\\T1.5;abc"                  },
    {"Alignment",             L"\\A1;a",                       L"a"                           },
    {"Stack",                 L"a\\S1/2;b",                    L"a\\S<0,100>1/2\\sb"          },
    {"StackAligned",          L"\\A1;\\S1/2;",                 L"\\A1;\\S<1,100>1/2\\s"       },
    {"BackslashBehindStack",  L"\\S1/2;\\\\P",                 L"\\S<0,100>1/2\\s"            },
    {"StackWithoutSign",      L"\\Sab;",                       L"\\\\Sab;"                    },
    {"Fields",                L"%<\\\\Date>% \\U+0025<",       L"%<\\\\Date>% \\U+0025<"      },
};

TEST(RoundTrip, RewritesAs) {
    for (TripCase const& row : kTrips) {
        Session session;
        EXPECT_EQ(shown(session.roundTrip(row.markup)), shown(row.result)) << row.name;
    }
}

// What a session ends with is what a further trip leaves alone.
TEST(RoundTrip, RewritesOnceOnly) {
    for (TripCase const& row : kTrips) {
        std::wstring const markup = row.markup;
        if (markup.find(L"\\S") != std::wstring::npos) continue;
        Session session;
        CStdStrW const first = session.roundTrip(markup);
        EXPECT_EQ(shown(session.roundTrip(first)), shown(first)) << row.name;
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
        Session session;
        CStdStrW const first = session.roundTrip(TzString::fromUtf8(text.markup).str());
        EXPECT_EQ(shown(first), text.first);
        CStdStrW const second = session.roundTrip(first);
        EXPECT_EQ(shown(second), text.second);
        // Each stack gains at most one marker a trip.
        EXPECT_LE(session.roundTrip(second).size(), second.size() + 16 * 8);
    }
}

}  // namespace
