// A text that a word processor saved in its own way, where one is installed.

#include <gtest/gtest.h>

#include <cstdlib>
#include <nlohmann/json.hpp>

#include "tests/support/program_run.h"

namespace {

namespace fs = std::filesystem;

// Paragraphs with a list, looks and faces, sizes and colours, stacks, other scripts, and a field.
constexpr char const* kMarkup =
    "{\\H1.5x;\\LSCOPE} \\\\Sx \\S1#2;\\P"
    "{\\fLiberation Sans|b1|i0|c0|p34;NOTE:} {\\fLiberation Sans|b0|i1|c0|p34;one} {\\Oold}\\P"
    "{\\Fromans.shx|c204;Simplex} {\\C1;red {\\H0.7x;\\S+0.1^-0.2;}} \\U+00FCber \\U+56F3\\P"
    "\\pi-1,l2,t4;1.\ttab";

struct ProcessorRow {
    char const* program;
    char const* contents;
};
constexpr ProcessorRow kProcessors[] = {
    {"soffice", "{\\H1.5x;\\LSCOPE} \\\\Sx \\S1#2;\\P"
                "{\\fLiberation Sans|b1|i0|c0|p34;NOTE:} {\\fLiberation Sans|b0|i1|c0|p34;one} "
                "{\\Oold}\\P{\\Fromans.shx|c204;Simplex} {\\C1;red \\H0.7x;\\S+0.1^-0.2;} "
                "\\U+00FCber \\U+56F3\\P\\pi-1,l2,t4;1.\ttab"},
    // It gives the mark of a paragraph the look of its last text, or of the next one's first.
    {"abiword", "{\\H1.5x;\\LSCOPE} \\\\Sx \\S1#2;{\\H1.5x;\\L\\P"
                "\\fLiberation Sans|b1|i0|c0|p34;\\H0.6667x;\\lNOTE:} "
                "{\\fLiberation Sans|b0|i1|c0|p34;one} {\\Oold"
                "\\fLiberation Sans|b1|i0|c0|p34;\\o\\P\\Fromans.shx|c204;Simplex} "
                "{\\C1;red \\H0.7x;\\S+0.1^-0.2;} \\U+00FCber \\U+56F3{\\Fromans.shx|c204;\\P"
                "\\pi-0.999269,l1.99927,t3.99927;}1.\ttab"},
    {"pandoc", "{\\fHelvetica|b0|i0|c0|p32;\\LSCOPE\\l \\\\Sx \\S1#2;\\P"
               "\\fHelvetica|b1|i0|c0|p32;NOTE:\\fHelvetica|b0|i0|c0|p32; "
               "\\fHelvetica|b0|i1|c0|p32;one\\fHelvetica|b0|i0|c0|p32; "
               "\\Oold\\o\\PSimplex red \\S+0.1^-0.2; \\U+00FCber \\U+56F3\\P1. tab}"},
};

class WordProcessors : public testing::TestWithParam<ProcessorRow> {};

TEST_P(WordProcessors, KeepTheText) {
    std::string const program = GetParam().program;
    if (std::system(("command -v " + program + " >/dev/null").c_str()) != 0)
        GTEST_SKIP() << program << " is not installed";
    // What happens to be installed decides about no change.
    if (std::getenv("CI") != nullptr) GTEST_SKIP() << "word processors are not asked in CI";
    nlohmann::json const drawing = {
        {"format", "tz-drawing"},
        {"version", 1},
        {"entities",
         {{{"handle", "2A"}, {"type", "MTEXT"}, {"location", {0, 0, 0}}, {"contents", kMarkup}}}}};
    fs::path const before = tztest::scratch("before.json", drawing.dump());
    fs::path const after = tztest::scratch("after.json");
    std::string const editor =
        (tztest::sourceFolder() / "tests/edit/resave.sh").string() + " " + program;
    tztest::ProgramRun const run = tztest::runProgram(
        {"--var", "MTEXTED=OLDEDITOR", "--rtf-editor", editor, "--script",
         tztest::scratch("edit.scr", "MTEDIT\n#2A\n").string(), "--save", after.string(),
         "--settings", tztest::scratch("settings.json", "{}").string(), before.string()});
    EXPECT_EQ(run.status, 0) << run.output << run.errors;
    auto const saved = nlohmann::json::parse(tztest::bytesOf(after));
    EXPECT_EQ(saved["entities"][0]["contents"].get<std::string>(), GetParam().contents);
}

INSTANTIATE_TEST_SUITE_P(Programs,
                         WordProcessors,
                         testing::ValuesIn(kProcessors),
                         [](auto const& row) { return row.param.program; });

}  // namespace
