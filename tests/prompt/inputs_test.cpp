// Every kind of question: how its prompt is laid out, and what its answers become.

#include <gtest/gtest.h>

#include <numbers>

#include "host/database/drawing.h"
#include "module/prompt/angle_input.h"
#include "module/prompt/distance_input.h"
#include "module/prompt/integer_input.h"
#include "module/prompt/keyword_input.h"
#include "module/prompt/point_input.h"
#include "module/prompt/real_input.h"
#include "module/prompt/string_input.h"
#include "tests/command_line/scripted_session.h"
#include "tests/prompt/texts.h"

namespace {

using tzhost::test::ScriptedSession;

enum class Default : bool { no, yes };

std::string numberText(double value) {
    return TzString::formatted(L"%g", value).toUtf8();
}

// Each asks once and gives "status result".
using Asker = std::string (*)(CKeywordTable& table, unsigned int flags, Default given);

std::string askKeyword(CKeywordTable& table, unsigned int flags, Default given) {
    CTzsKeywordInput input(flags, table, L"Pick");
    if (given == Default::yes) input.SetDefault(kWithComma);
    std::string const status = std::to_string(input.Prompt());
    return status + " " + std::to_string(input.GetKeyword()) + " " + input.GetInput().toUtf8();
}

std::string askText(CTzsStringInput& input, Default given) {
    if (given == Default::yes) input.SetDefault(L"dflt");
    std::string const status = std::to_string(input.Prompt());
    return status + " " + input.GetInput().toUtf8();
}
std::string askLine(CKeywordTable& table, unsigned int flags, Default given) {
    CTzsStringInput input(flags, table, L"Pick", true);
    return askText(input, given);
}
std::string askWord(CKeywordTable& table, unsigned int flags, Default given) {
    CTzsStringInput input(flags, table, L"Pick", false);
    return askText(input, given);
}
std::string askSymbol(CKeywordTable& table, unsigned int flags, Default given) {
    CTzsSymbolStringInput input(flags, table, L"Pick");
    return askText(input, given);
}

std::string askNumber(CTzsRealInput& input, Default given) {
    if (given == Default::yes) input.SetDefault(1.5);
    std::string const status = std::to_string(input.Prompt());
    std::string const keyword =
        input.GetKeyword() == 0 ? "" : " " + std::to_string(input.GetKeyword());
    std::string const text = input.GetInput().isEmpty() ? "" : " " + input.GetInput().toUtf8();
    return status + " " + numberText(input.GetReal()) + keyword + text;
}
std::string askReal(CKeywordTable& table, unsigned int flags, Default given) {
    CTzsRealInput input(flags, table, L"Pick");
    return askNumber(input, given);
}
template <class Input>
std::string askMeasure(CKeywordTable& table, unsigned int flags, Default given) {
    constexpr double kBase[3] = {1, 1, 0};
    Input input(flags, table, L"Pick", kBase);
    return askNumber(input, given);
}

std::string askInteger(CKeywordTable& table, unsigned int flags, Default given) {
    CTzsIntegerInput input(flags, table, L"Pick");
    if (given == Default::yes) input.SetDefault(7);
    std::string const status = std::to_string(input.Prompt());
    return status + " " + std::to_string(input.GetInteger());
}

std::string askPoint(CKeywordTable& table, unsigned int flags, Default) {
    CTzsPointInput input(flags, table, L"Pick", nullptr);
    std::string const status = std::to_string(input.Prompt());
    double user[3];
    double world[3];
    input.GetPoint(user);
    input.GetPointInWorldCS(world);
    return status + " " + numberText(user[0]) + "," + numberText(user[1]) + " " +
           numberText(world[0]) + "," + numberText(world[1]);
}

enum class Words : bool { no, yes };
struct AskRow {
    char const* name;
    Asker ask;
    Words words;
    unsigned int flags;
    Default given;
    char const* answer;
    char const* result;
    wchar_t const* shown;  // the transcript
};
constexpr Asker kAngle = askMeasure<CTzsAngleInput>;
constexpr Asker kOrient = askMeasure<CTzsOrientationInput>;
constexpr Asker kDist = askMeasure<CTzsDistanceInput>;
constexpr Words kNone = Words::no;
constexpr Words kWords = Words::yes;
constexpr Default kNo = Default::no;
constexpr Default kYes = Default::yes;
// The user system is moved by 10,0 and turned by nothing.
constexpr AskRow kAsks[] = {
    // The default of a keyword stands after the brackets, the default of a value before them.
    {"Keyword", askKeyword, kWords, 0, kNo, "_gh\n", "5100 3 Gh",
     L"Pick [A = (b c)/Two words/Höhe]: _gh\n"},
    {"KeywordInTheUsersLanguage", askKeyword, kWords, 0, kNo, "HÖHE\n", "5100 5 Height",
     L"Pick [A = (b c)/Two words/Höhe]: HÖHE\n"},
    {"KeywordDefault", askKeyword, kWords, 0, kYes, "\n", "5000 0 ",
     L"Pick [A = (b c)/Two words/Höhe] <Two words>: \n"},
    {"KeywordDefaultAlone", askKeyword, kNone, 0, kYes, "\n", "5000 0 ", L"Pick <>: \n"},
    {"KeywordCancelled", askKeyword, kWords, 0, kNo, "^C\n", "-5002 0 ",
     L"Pick [A = (b c)/Two words/Höhe]: ^C\n"},
    {"KeywordRefusesEmpty", askKeyword, kWords, 1, kYes, "\na\n", "5100 3 Gh", L""},
    {"Line", askLine, kNone, 0, kNo, "some words\n", "5100 some words", L"Pick: some words\n"},
    {"LineEmpty", askLine, kNone, 0, kNo, "\n", "5000 ", L"Pick: \n"},
    {"LineDefault", askLine, kWords, 0, kYes, "\n", "5000 ",
     L"Pick <dflt> [A = (b c)/Two words/Höhe]: \n"},
    {"LineCancelled", askLine, kNone, 0, kNo, "^C\n", "-5002 ", L"Pick: ^C\n"},
    {"Word", askWord, kNone, 0, kNo, "some words\n", "5100 some", L"Pick: some words\n"},
    {"Symbol", askSymbol, kNone, 0, kYes, "a|b*\n", "5100 a|b*", L"Pick <dflt>: a|b*\n"},
    {"SymbolEmpty", askSymbol, kNone, 0, kYes, "\n", "5000 ", L"Pick <dflt>: \n"},
    {"Real", askReal, kNone, 0, kNo, "2.5\n", "5100 2.5", L"Pick: 2.5\n"},
    {"RealDefault", askReal, kNone, 0, kYes, "\n", "5000 1.5", L"Pick <1.5000>: \n"},
    // A default lets an empty answer through that the flags refused; without one it is asked again.
    {"RealDefaultAgainstFlags", askReal, kNone, 1, kYes, "\n", "5000 1.5", L"Pick <1.5000>: \n"},
    {"RealRefusesEmpty", askReal, kNone, 1, kNo, "\n3\n", "5100 3", L""},
    {"RealEmptyWithoutDefault", askReal, kNone, 0, kNo, "\n", "5000 0", L"Pick: \n"},
    {"RealKeyword", askReal, kWords, 0, kYes, "höhe\n", "-5005 0 5 Height",
     L"Pick <1.5000> [A = (b c)/Two words/Höhe]: höhe\n"},
    {"RealFreeText", askReal, kNone, 0x80, kNo, "2x\n", "-5005 0 2x", L"Pick: 2x\n"},
    {"RealCancelled", askReal, kNone, 0, kYes, "^C\n", "-5002 0", L"Pick <1.5000>: ^C\n"},
    {"Angle", kAngle, kNone, 0, kNo, "180\n", "5100 3.14159", L"Pick: 180\n"},
    {"AngleByPoint", kAngle, kNone, 0, kNo, "1,5\n", "5100 1.5708", L"Pick: 1,5\n"},
    {"AngleDefault", kAngle, kNone, 0, kYes, "\n", "5000 1.5", L"Pick <86>: \n"},
    {"OrientationDefault", kOrient, kNone, 1, kYes, "\n", "5000 1.5", L"Pick <86>: \n"},
    {"OrientationByPoint", kOrient, kNone, 0, kNo, "5,1\n", "5100 0", L"Pick: 5,1\n"},
    {"Distance", kDist, kNone, 6, kNo, "-1\n4,5\n", "5100 5", L""},
    {"DistanceDefault", kDist, kNone, 6, kYes, "\n", "5000 1.5", L"Pick <1.5000>: \n"},
    {"Integer", askInteger, kNone, 0, kNo, "100\n", "5100 100", L"Pick: 100\n"},
    {"IntegerWithinItsBounds", askInteger, kNone, 0, kNo, "1\n101\n2\n", "5100 2", L""},
    {"IntegerDefaultAgainstFlags", askInteger, kNone, 0x138F, kYes, "\n", "5000 7",
     L"Pick <7>: \n"},
    {"Point", askPoint, kNone, 0, kNo, "1,2\n", "5100 1,2 11,2", L"Pick: 1,2\n"},
    {"PointKeyword", askPoint, kWords, 0, kNo, "a\n", "-5005 0,0 10,0",
     L"Pick [A = (b c)/Two words/Höhe]: a\n"},
};

class Inputs : public testing::TestWithParam<AskRow> {};
TEST_P(Inputs, AskAndRead) {
    AskRow const& row = GetParam();
    auto const drawing = tzhost::Drawing::create();
    tzhost::DrawingSettings settings = drawing->settings();
    settings.modelSystem.origin = TzGePoint3d(10, 0, 0);
    drawing->setSettings(settings);
    tzhost::setWorkingDrawing(drawing.get());
    constexpr unsigned int kIds[] = {kManyWords, kWithComma, kTranslated};
    CKeywordTable table(kIds, row.words == Words::yes ? 3 : 0);
    std::string result;
    std::wstring transcript;
    {
        ScriptedSession const session(row.answer);
        result = row.ask(table, row.flags, row.given);
        transcript = session.transcript();
    }
    tzhost::setWorkingDrawing(nullptr);
    EXPECT_EQ(result, row.result);
    if (row.shown[0] != L'\0') {
        EXPECT_EQ(transcript, row.shown);
    }
}
INSTANTIATE_TEST_SUITE_P(Rows, Inputs, testing::ValuesIn(kAsks), [](auto const& row) {
    return row.param.name;
});

// The keywords as the host is told them, local ones first, and the flags.
TEST(Questions, HandKeywordsAndFlagsToTheHost) {
    constexpr unsigned int kIds[] = {kManyWords, kWithComma, kTranslated};
    CKeywordTable table(kIds, 3);
    ScriptedSession const session("a\n");
    CTzsRealInput input(0x85, table, L"");
    EXPECT_EQ(input.KeywordList(), L"Abc Twowords,Alias Höhe _Gh Twowords Height");
    EXPECT_EQ(input.PromptString(), L"A = (b c)/Two words/Höhe");
    EXPECT_EQ(input.GetKeywordCount(), 3);
    EXPECT_EQ(input.GetKeywordString(kTranslated, true), L"Höhe");
    EXPECT_EQ(input.Prompt(), statusKeyword);
    EXPECT_NE(session.events().find("\"flags\":133"), std::string::npos) << session.events();
    input.SetDefault(1);
    EXPECT_EQ(input.GetFlags(), 0x84U);
}

// Each asking forgets the answer before it.
TEST(Questions, RememberTheLastAnswerAlone) {
    CKeywordTable none;
    ScriptedSession const session("first\n\n");
    CTzsStringInput input(0, none, L"Pick", true);
    EXPECT_EQ(input.Prompt(), statusNormal);
    EXPECT_EQ(input.GetInput(), L"first");
    EXPECT_EQ(input.Prompt(), statusNone);
    EXPECT_EQ(input.GetInput(), L"");
}

}  // namespace
