// Every kind of question: which answers it takes and with which status.

#include <gtest/gtest.h>

#include <numbers>

#include "host/base/fault_point.h"
#include "host/command_line/point_input.h"
#include "tests/command_line/scripted_session.h"
#include "tz/ed/print.h"
#include "tz/ed/prompt_objects.h"
#include "tz/ed/prompts.h"
#include "tz/rx/resbuf.h"
#include "tz/rx/status.h"

namespace {

using tzhost::test::ScriptedSession;

std::string numbers(std::initializer_list<double> values) {
    std::string text;
    for (double const value : values) {
        text += (text.empty() ? "" : ",") + TzString::formatted(L"%.6g", value + 0.0).toUtf8();
    }
    return text;
}

// Each asks one question, with or without a base point, and gives "status value".
using Asker = std::string (*)(double const* base);

template <class Value>
std::string shown(int status, Value const& value) {
    bool const hasValue = status == Tzad::ePromptNormal;
    return std::to_string(status) + (hasValue ? " " + value : std::string());
}

std::string askPoint(double const* base) {
    double point[3] = {};
    int const status = tzedGetPoint(base, L"? ", point);
    return shown(status, numbers({point[0], point[1], point[2]}));
}
template <int (*kAsk)(double const*, wchar_t const*, double*)>
std::string askMeasure(double const* base) {
    double value = 0;
    int const status = kAsk(base, L"? ", &value);
    return shown(status, numbers({value}));
}
std::string askReal(double const*) {
    double value = 0;
    int const status = tzedGetReal(L"? ", &value);
    return shown(status, numbers({value}));
}
std::string askInteger(double const*) {
    int value = 0;
    int const status = tzedGetInt(L"? ", &value, -3, 100);
    return shown(status, std::to_string(value));
}
std::string askKeyword(double const*) {
    TzString word;
    int const status = tzedGetKword(L"? ", word);
    return shown(status, word.toUtf8());
}
std::string askWord(double const*) {
    TzString text;
    int const status = tzedGetString(0, L"? ", text);
    return shown(status, text.toUtf8());
}
std::string askText(double const*) {
    TzString text;
    int const status = tzedGetString(1, L"? ", text);
    return shown(status, text.toUtf8());
}
std::string askSymbol(double const*) {
    wchar_t* text = nullptr;
    int const status = TzEdSymbolUtilities::servicesPtr100()->getSymbolString(text, L"? ", nullptr);
    std::string const result = shown(status, TzString(text).toUtf8());
    tzutDelBuffer(text);
    return result;
}

struct QuestionRow {
    char const* name;
    Asker ask;
    int flags;
    std::string_view script;
    std::string_view result;
};

constexpr Asker kDistance = askMeasure<tzedGetDist>;
constexpr Asker kAngle = askMeasure<tzedGetAngle>;
constexpr Asker kOrient = askMeasure<tzedGetOrient>;

// The words are "Breite Höhe _Width Height"; the base point is 1,1,0 and the last point 10,20,30.
constexpr QuestionRow kQuestions[] = {
    {"PointFlat", askPoint, 0, "1.5,2", "5100 1.5,2,0"},
    {"PointInSpace", askPoint, 0, " -1, 2 ,3e2 ", "5100 -1,2,300"},
    {"PointInFeet", askPoint, 0, "1'-6\",1/2", "5100 18,0.5,0"},
    {"PointRelative", askPoint, 0, "@1,-2", "5100 11,18,30"},
    {"PointRelativeSpace", askPoint, 0, "@1,1,1", "5100 11,21,31"},
    {"PointPolar", askPoint, 0, "@2<90", "5100 10,22,30"},
    {"PointPolarAbsolute", askPoint, 0, "2<180d", "5100 -2,0,0"},
    {"PointLast", askPoint, 0, "@", "5100 10,20,30"},
    {"PointRefused", askPoint, 0, "1\n1,2,3,4\nx,1\n1,\n#2A\n@x\n1<\n1e308,1e999\n3,4",
     "5100 3,4,0"},
    {"PointNone", askPoint, 0, "", "5000"},
    {"PointNeeded", askPoint, 1, "\n\n1,1", "5100 1,1,0"},
    {"PointWord", askPoint, 0, "h", "-5005 Height"},
    {"PointFreeText", askPoint, 0x80, "elsewhere", "-5005 elsewhere"},
    {"PointCancel", askPoint, 1, "^C", "-5002"},
    {"PointZeroTaken", askPoint, 6, "0,0", "5100 0,0,0"},
    {"Real", askReal, 0, "-1.5e1", "5100 -15"},
    {"RealFraction", askReal, 0, "1 1/2", "5100 1.5"},
    {"RealTooLarge", askReal, 0, "1.7e308 1.7e308/1\n7", "5100 7"},
    {"RealTakesNoPoint", askReal, 0, "1,2\n1'\n7", "5100 7"},
    {"RealNoZero", askReal, 2, "0\n-0\n-1", "5100 -1"},
    {"RealNoNegative", askReal, 4, "-1\n0", "5100 0"},
    {"RealOtherBits", askReal, 0x79, "0", "5100 0"},
    {"Integer", askInteger, 0, "+42", "5100 42"},
    {"IntegerLimits", askInteger, 0, "101\n-4\n9999999999\n1.5\n100", "5100 100"},
    {"IntegerNoNegative", askInteger, 4, "-1\n1", "5100 1"},
    {"Distance", kDistance, 6, "1'-3 1/2\"", "5100 15.5"},
    {"DistanceFromBase", kDistance, 6, "4,5", "5100 5"},
    {"DistanceZeroPoint", kDistance, 6, "1,1\n1,2", "5100 1"},
    {"DistanceFreeText", kDistance, 0x84, "1.5x", "-5005 1.5x"},
    {"DistanceNotFree", kDistance, 0x84, "-1\n2", "5100 2"},
    {"DistanceNone", kDistance, 6, "", "5000"},
    {"AngleDegrees", kAngle, 0, "180", "5100 3.14159"},
    {"AngleSurveyor", kAngle, 0, "n 45 w", "5100 2.35619"},
    {"AngleNegative", kAngle, 0, "-90", "5100 -1.5708"},
    {"AngleFromBase", kAngle, 0, "1,0", "5100 4.71239"},
    {"Orientation", kOrient, 0, "0,1", "5100 3.14159"},
    {"Keyword", askKeyword, 0, "br", "5100 Width"},
    {"KeywordGlobal", askKeyword, 0, "_Height", "5100 Height"},
    {"KeywordRefused", askKeyword, 0, "x\n1\nHöh", "5100 Height"},
    {"KeywordNone", askKeyword, 0, "", "5000"},
    {"KeywordNeeded", askKeyword, 1, "\nb", "5100 Width"},
    {"KeywordFreeText", askKeyword, 0x80, "other", "-5005 other"},
    {"Text", askText, 0, "  two words ", "5100   two words "},
    {"TextNone", askText, 0, "", "5100 "},
    {"TextNeeded", askText, 1, "\nx", "5100 x"},
    {"TextWord", askText, 0, "breite", "-5005 Width"},
    {"TextSpecials", askText, 0, ";;no\n<<<", "5100 <<<"},
    {"TextCancel", askText, 0, "^C", "-5002"},
    {"WordEndsAtBlank", askWord, 0, "two words", "5100 two"},
    {"Symbol", askSymbol, 0, "Standard", "5100 Standard"},
    {"SymbolPatterns", askSymbol, 0, "~A[bc]*?,x|y", "5100 ~A[bc]*?,x|y"},
    {"SymbolRefused", askSymbol, 0, "a=b\na<b\n?", "5100 ?"},
    {"SymbolNone", askSymbol, 0, "", "5000"},
};

class Questions : public testing::TestWithParam<QuestionRow> {};
TEST_P(Questions, End) {
    ScriptedSession const session(std::string(GetParam().script) + "\n");
    tzhost::setLastPoint({10, 20, 30});
    double const base[3] = {1, 1, 0};
    ASSERT_EQ(tzedInitGet(GetParam().flags, L"Breite Höhe _Width Height"), Tzad::ePromptNormal);
    std::string result = GetParam().ask(base);
    TzString input;
    if (tzedGetInput(input) == Tzad::ePromptNormal) result += " " + input.toUtf8();
    EXPECT_EQ(result, GetParam().result);
    EXPECT_EQ(tzedGetInput(input), Tzad::ePromptError);
    EXPECT_TRUE(input.isEmpty());
    EXPECT_FALSE(tzhost::commandLine().hasFailed());
}
INSTANTIATE_TEST_SUITE_P(Answers, Questions, testing::ValuesIn(kQuestions), [](auto const& row) {
    return row.param.name;
});

TEST(Question, WithoutBaseAsksForTwoPoints) {
    ScriptedSession const session("0,0\nx\n3,4\n10,10\n10,5\n");
    EXPECT_EQ(kDistance(nullptr), "5100 5");
    EXPECT_EQ(kAngle(nullptr), "5100 4.71239");
    EXPECT_EQ(session.transcript(), L"? 0,0\nSecond point: x\nA length is needed, or a point.\n"
                                    L"Second point: 3,4\n? 10,10\nSecond point: 10,5");
    TzGePoint3d const last = tzhost::lastPoint();
    EXPECT_TRUE(last.isEqualTo({10, 5, 0}));
}

TEST(Question, SpendsTheArmedFlags) {
    ScriptedSession const session("\n\nb\n");
    ASSERT_EQ(tzedInitGet(1, L"Breite"), Tzad::ePromptNormal);
    ASSERT_EQ(tzedInitGet(0, nullptr), Tzad::ePromptNormal);
    EXPECT_EQ(askReal(nullptr), "5000");
    ASSERT_EQ(tzedInitGet(1, L"Breite"), Tzad::ePromptNormal);
    EXPECT_EQ(tzedInitGet(0, L"One Two _One"), Tzad::ePromptError);
    EXPECT_EQ(askReal(nullptr), "-5005");
    EXPECT_EQ(askReal(nullptr), "-5002");
}

TEST(Question, AtTheEndOfTheInputIsCancelled) {
    ScriptedSession const session("7\nx");
    EXPECT_EQ(askReal(nullptr), "5100 7");
    EXPECT_FALSE(tzhost::commandLine().hasFailed());
    EXPECT_EQ(askReal(nullptr), "-5002");
    EXPECT_EQ(askReal(nullptr), "-5002");
    EXPECT_TRUE(tzhost::commandLine().hasFailed());
}

TEST(Question, ThatFailsWithoutEndIsCancelled) {
    ScriptedSession const session("1\n");
    auto const before = tzhost::setFaultHook(
        [](std::string_view operation, int&) { return operation == "tzedGetReal"; });
    int rounds = 0;
    while (askReal(nullptr) == "-5001" && rounds < 1000)
        ++rounds;
    EXPECT_EQ(rounds, 99);
    for (int i = 0; i < 60; ++i)
        EXPECT_EQ(askReal(nullptr), "-5001");
    EXPECT_EQ(askText(nullptr), "5100 1");
    for (int i = 0; i < 60; ++i)
        EXPECT_EQ(askReal(nullptr), "-5001");
    tzhost::setFaultHook(before);
}

TEST(Question, ReportsFaultsOfTheScript) {
    ScriptedSession const session("<<<\ntext\n>>>\n8\n");
    EXPECT_EQ(askReal(nullptr), "5100 8");
    EXPECT_EQ(session.errors(), L"script:1: no editor takes this block\n");
    EXPECT_TRUE(tzhost::commandLine().hasFailed());
}

TEST(Question, TellsEvents) {
    ScriptedSession const session("x\nb\n");
    ASSERT_EQ(tzedInitGet(6, L"Breite _Width"), Tzad::ePromptNormal);
    EXPECT_EQ(kDistance(nullptr), "-5005");
    tzutPrintf(L"\n%d é", 5);
    EXPECT_EQ(
        session.events(),
        R"({"event":"prompt","kind":"distance","text":"? ","keywords":"Breite _Width","flags":6}
{"event":"answer","line":"x","status":-5001}
{"event":"answer","line":"b","status":-5005}
{"event":"print","text":"\n5 é"}
)");
}

TEST(Transcript, EndsEachLineOnce) {
    ScriptedSession const session("5\n6\n\n7\n");
    tzutPrintf(L"Height is %d", 1);
    (void)askReal(nullptr);
    tzutPrintf(L"\n");
    (void)askReal(nullptr);
    tzutPrintf(L"one, ");
    tzutPrintf(L"two\n");
    tzutPrintf(L"\nthree");
    (void)askReal(nullptr);
    (void)askReal(nullptr);
    tzhost::commandLine().say(L"Done.");
    tzutPrintf(L"\n");
    tzutPrintf(L"end");
    EXPECT_EQ(session.transcript(),
              L"Height is 1\n? 5\n? 6\none, two\nthree\n? \n? 7\nDone.\n\nend");
}

TEST(PromptObjects, AskAgainAndAgain) {
    ScriptedSession const session("s\n\n\n_R\n45\n");
    TzEdPromptKeyword word;
    word.setMessageAndKeywords(L"Change: ", L"Style Rotate");
    EXPECT_EQ(word.getKeyword(), Tzad::ePromptNormal);
    EXPECT_EQ(word.resultString(), L"Style");
    EXPECT_EQ(word.getKeyword(), Tzad::ePromptNone);
    EXPECT_TRUE(word.resultString().isEmpty());
    word.setAllowNone(false);
    EXPECT_EQ(word.getKeyword(), Tzad::ePromptNormal);
    EXPECT_EQ(word.resultString(), L"Rotate");
    TzEdPromptAngle angle(L"Angle: ");
    EXPECT_EQ(angle.getAngle(), Tzad::ePromptNormal);
    EXPECT_DOUBLE_EQ(angle.value(), std::numbers::pi / 4);
    EXPECT_EQ(angle.getAngle(), Tzad::ePromptCancel);
}

TEST(PromptObjects, GiveTheirDefault) {
    ScriptedSession const session("\n1,1\n");
    TzEdPromptAngle angle(L"Angle: ");
    angle.setBasePoint({1, 0, 0});
    angle.setDefaultValue(2);
    EXPECT_EQ(angle.getAngle(), Tzad::ePromptNormal);
    EXPECT_EQ(angle.value(), 2);
    EXPECT_EQ(angle.getAngle(), Tzad::ePromptNormal);
    EXPECT_DOUBLE_EQ(angle.value(), std::numbers::pi / 2);
}

TEST(SymbolNames, OfNewSymbols) {
    auto const* const services = TzEdSymbolUtilities::servicesPtr100();
    for (wchar_t const* name : {L"Standard", L"My style", L"Größe-1", L"a[b]"}) {
        EXPECT_TRUE(services->isValidSymbolName(name)) << TzString(name).toUtf8();
    }
    for (wchar_t const* name : {L"", L" a", L"a ", L"a|b", L"a*", L"?", L"a,b", L"a=b", L"a\nb"}) {
        EXPECT_FALSE(services->isValidSymbolName(name)) << TzString(name).toUtf8();
    }
    EXPECT_TRUE(services->isValidSymbolName(std::wstring(255, L'a').c_str()));
    EXPECT_FALSE(services->isValidSymbolName(std::wstring(256, L'a').c_str()));
    EXPECT_FALSE(services->isValidSymbolName(nullptr));
}

}  // namespace
