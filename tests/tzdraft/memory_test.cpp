// Runs with planned faults: events are told whole while memory fails, and a plan that struck
// nothing is named.

#include <gtest/gtest.h>

#include <algorithm>

#include "tests/support/program_run.h"

namespace {

using tztest::scratch;

// What was built for the events used to end the program when memory failed, and NEW used to leave
// the session without a document.
TEST(MemoryFaults, LeaveEventsWhole) {
    constexpr int kCalls = 800;
    constexpr int kStep = 7;
    auto const script = scratch(
        "two.scr", "NEW\n-MTEXT\n0,0\n@5,2\nNote\n\nMTEXT\n0,0\n~3,3\n5,5\n<<<\nabc\n>>>\nQUIT\n");
    auto const file = scratch("two.jsonl");
    for (int call = 1; call <= kCalls; call += kStep) {
        tztest::ProgramRun const run =
            tztest::runProgram({"--script", script.string(), "--events", file.string(), "--fail",
                                "operator new:" + std::to_string(call)});
        EXPECT_LE(run.status, 1) << call << ": " << run.errors;
        int audits = 0;
        for (auto const& event : tztest::eventsOf(file)) {
            if (event["event"] != "audit") continue;
            ++audits;
            EXPECT_TRUE(tztest::isClean(event)) << call << ": " << event;
        }
        EXPECT_EQ(audits, 4) << call << ": " << run.output;
    }
}

// Runs two calls of functions while the operation fails, and expects a line of output.
void expectStruckFunctions(std::string const& operation, std::string const& shown) {
    auto const script = scratch("call.scr", "(x \"a\")\n(x #1)\n");
    auto const file = scratch("call.jsonl");
    tztest::ProgramRun const run = tztest::runProgram(
        {"--script", script.string(), "--events", file.string(), "--fail", operation});
    EXPECT_EQ(run.status, 0) << run.errors;
    EXPECT_EQ(run.errors, "");
    EXPECT_NE(run.output.find(shown), std::string::npos) << run.output;
    auto const events = tztest::eventsOf(file);
    EXPECT_EQ(std::count_if(events.begin(), events.end(),
                            [](auto const& event) { return event["event"] == "audit"; }),
              2);
}

// Calls of functions used to be beyond the plan for memory and without an audit, and a record that
// the host did not give ended the program.
TEST(Faults, ReachRecordsOfFunctionCalls) {
    expectStruckFunctions("tzutNewRb:*", "(x \"a\"): the argument");
}

TEST(Faults, ReachMemoryOfFunctionCalls) {
#ifdef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "the sanitizer's own operator new serves in this build";
#endif
    expectStruckFunctions("operator new", "(x \"a\") ended early: there is not enough memory");
}

// A misspelt name used to look like a fault that was survived.
TEST(Faults, ThatStruckNothingAreNamed) {
    auto const script = scratch("ask.scr", "CIRCLE\n0,0\n1\nQUIT\n");
    tztest::ProgramRun const run =
        tztest::runProgram({"--script", script.string(), "--fail", "tzedGetPiont", "--fail",
                            "tzedGetPoint:7", "--fail", "TzDbDatabase::setClayer:*"});
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.errors,
              "tzdraft: --fail \"tzedGetPiont\": made nothing fail; calls of the operation: 0\n"
              "tzdraft: --fail \"tzedGetPoint:7\": made nothing fail; calls of the operation: 1\n"
              "tzdraft: --fail \"TzDbDatabase::setClayer:*\": made nothing fail; calls of the "
              "operation: 0\n");
}

struct ShortRow {
    char const* name;
    int letters;
    char const* kilobytes;  // of memory
    char const* result;
    int status;
    char const* says;
};

// Memory that ran short used to end the program by a signal, and a plot took 5 KB a letter.
constexpr ShortRow kShortRows[] = {
    {"Opening", 30'000'000, "150000", "--pdf", 2, "short.json: cannot be read: memory ran short\n"},
    {"Result", 1'000'000, "100000", "--save", 2, "result: cannot be written: memory ran short\n"},
    {"OneKilobyteALetter", 200'000, "280000", "--pdf", 0, ""},
};

class ShortMemory : public testing::TestWithParam<ShortRow> {};

TEST_P(ShortMemory, IsSaid) {
#ifdef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "the sanitizer needs the memory that is left out here";
#endif
    std::string drawing = R"({"format": "tz-drawing", "version": 1, "entities": [)"
                          R"({"handle": "2A", "type": "MTEXT", "contents": ")";
    for (int letters = 0; letters < GetParam().letters; letters += 4)
        drawing += "abc ";
    std::filesystem::path const file = scratch("short.json", drawing + "\"}]}");
    tztest::ProgramRun const run =
        tztest::startProgram(file.string() + " --script /dev/null " + GetParam().result + " " +
                                 scratch("result").string(),
                             std::string("ulimit -v ") + GetParam().kilobytes + "; ");
    std::filesystem::remove(file);
    EXPECT_EQ(run.status, GetParam().status);
    EXPECT_TRUE(run.errors.ends_with(GetParam().says)) << run.errors;
    EXPECT_LE(std::count(run.errors.begin(), run.errors.end(), '\n'), 1) << run.errors;
}

TEST(ShortMemory, NamesSettingsThatDoNotFit) {
#ifdef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "the sanitizer needs the memory that is left out here";
#endif
    std::string const long30 = "{\"textEditor\": \"" + std::string(30'000'000, 'a') + "\"}";
    std::filesystem::path const file = scratch("short.settings", long30);
    tztest::ProgramRun const run = tztest::startProgram(
        "--script /dev/null --settings " + file.string(), "ulimit -v 150000; ");
    std::filesystem::remove(file);
    EXPECT_EQ(run.status, 2);
    EXPECT_EQ(run.errors,
              "tzdraft: --settings " + file.string() + ": cannot be read: memory ran short\n");
}

INSTANTIATE_TEST_SUITE_P(Rows, ShortMemory, testing::ValuesIn(kShortRows), [](auto const& row) {
    return row.param.name;
});

}  // namespace
