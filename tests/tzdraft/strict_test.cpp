// Scripts under --strict and --quiet: where they end, what they say, and that they go on otherwise.

#include <gtest/gtest.h>

#include "tests/support/program_run.h"

namespace {

using tztest::scratch;

struct ScriptRow {
    char const* name;
    char const* script;  // SAVE would follow it
    int status;
    char const* error;   // after the script's name; empty: nothing goes wrong
    bool isTold = true;  // in the transcript, too
};

constexpr ScriptRow kRows[] = {
    {"Right", "-MTEXT\n0,0\nStyle\nStandard\n5,5\nabc\n\nLIST\nall\n\n", 0, ""},
    {"UnknownCommand", "LINE\n0,0\n1,1\n\n;; here\nLIEN\n", 1, ":6: There is no command \"LIEN\"."},
    {"RefusedPoint", "LINE\nhere\n0,0\n1,1\n\n", 1, ":2: A point is needed"},
    {"RefusedWord", "MTEXT\n0,0\nSlope\n^C\n", 1, ":3: A point is needed"},
    {"RefusedSelection", "ERASE\nthis\n\n", 1, ":2: "},
    {"RefusedInADrag", "MTEXT\n0,0\n~1,1\nno\n^C\n", 1, ":4: "},
    {"BlockNotTaken", "NEW\n<<<\nabc\n>>>\n", 1, ":2: no editor takes this block", false},
    {"NoEditor", "MTEXT\n0,0\n5,5\n", 1, ":3: There is no editor"},
    {"CallOfNoFunction", "(nosuch)\n", 1, ":1: (nosuch): no module defines this function"},
    {"CallThatSaysWhatIsWrong", "(MTEDIT \"a\")\n", 1, ":1: This function takes one entity name."},
    {"CallOfAnotherEntity", "LINE\n0,0\n1,1\n\n(MTEDIT #1)\n", 1, ":5: That is no multi-line text"},
    {"CallOfNoEntity", "(MTEDIT #99)\n", 1, ":1: (MTEDIT #99): there is no such entity"},
    {"CallOfAFunctionWithoutBody", "(TEXTALIGN)\n", 1, ":1: (TEXTALIGN): the function failed"},
    {"CallThatWorks", "-MTEXT\n0,0\n5,5\nabc\n\n(MTEDIT #1)\n<<<\nx\n>>>\n", 0, ""},
    {"CannotBeThere", "LINE\n0,0\n1e308,1\n\nMOVE\nall\n\n0,0\n1e308,0\n", 1,
     ":9: Objects that cannot be there: 1."},
    {"HostCommand", "LAYER\nSet\nNOSUCH\n\n", 1, ":3: There is no layer \"NOSUCH\"."},
    {"VariableOutsideItsLimits", "SETVAR\nLUNITS\n9\n", 1, ":3: LUNITS takes"},
    {"RefusedPaper", "PAGE\nB5\n", 1, ":2: That is not what is asked for, expected A0 to A4"},
    {"FileCommand", "OPEN\n/nosuch/a.json\n", 1, ":2: /nosuch/a.json: cannot be read: No such"},
    {"LeftOver", "-MTEXT\n0,0\n5,5\nabc\n\nSELECT\nall\n\nMTEDIT\n", 3,
     ":9: MTEDIT left something open."},
};

// A script gone wrong, in one of two ways of running it.
tztest::ProgramRun runRow(ScriptRow const& row, std::vector<std::string> options) {
    auto const script = scratch("strict.scr", std::string(row.script) + "SAVE\n" +
                                                  scratch("end.json").string() + "\n");
    std::filesystem::remove(scratch("end.json"));
    options.insert(options.end(), {"--script", script.string(), "--settings",
                                   scratch("settings.json", "{}").string()});
    if (row.status == 3) options.insert(options.end(), {"--fail", "tzedSSLength"});
    return tztest::runProgram(options);
}

class Strict : public testing::TestWithParam<ScriptRow> {};

TEST_P(Strict, EndsAtTheFirstThingThatGoesWrong) {
    ScriptRow const& row = GetParam();
    tztest::ProgramRun const run = runRow(row, {"--strict", "--quiet"});
    EXPECT_EQ(run.status, row.status) << run.errors;
    bool const isRight = *row.error == '\0';
    EXPECT_EQ(exists(scratch("end.json")), isRight);
    if (isRight) {
        EXPECT_EQ(run.output + run.errors, "");
        return;
    }
    std::string const name = scratch("strict.scr").string();
    ASSERT_TRUE(run.errors.starts_with(name + row.error)) << run.errors;
    EXPECT_EQ(run.errors.find('\n'), run.errors.size() - 1) << run.errors;
    std::size_t const text = run.errors.find(": ", name.size() + 1) + 2;
    EXPECT_EQ(run.output, row.isTold ? run.errors.substr(text) : "");
}

TEST_P(Strict, GoesOnWithoutTheOption) {
    tztest::ProgramRun const run = runRow(GetParam(), {});
    EXPECT_TRUE(exists(scratch("end.json"))) << run.output;
    EXPECT_NE(run.output.find("Command: SAVE\n"), std::string::npos);
}

INSTANTIATE_TEST_SUITE_P(Rows, Strict, testing::ValuesIn(kRows), [](auto const& row) {
    return row.param.name;
});

}  // namespace
