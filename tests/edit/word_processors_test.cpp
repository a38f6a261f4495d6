// A text that a word processor saved in its own way, where one is installed.

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <map>
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

// Why a word processor is not asked; empty when it is.
std::string reasonToSkip(std::string const& program) {
    // What happens to be installed decides about no change.
    if (std::getenv("CI") != nullptr) return "word processors are not asked in CI";
    bool const isThere = std::system(("command -v " + program + " >/dev/null").c_str()) == 0;
    return isThere ? "" : program + " is not installed";
}

// What MTEDIT leaves of a text with that program as its editor.
std::string editedBy(std::string const& editor, std::string const& contents) {
    nlohmann::json const drawing = {
        {"format", "tz-drawing"},
        {"version", 1},
        {"entities",
         {{{"handle", "2A"}, {"type", "MTEXT"}, {"location", {0, 0, 0}}, {"contents", contents}}}}};
    fs::path const before = tztest::scratch("before.json", drawing.dump());
    fs::path const after = tztest::scratch("after.json");
    tztest::ProgramRun const run = tztest::runProgram(
        {"--var", "MTEXTED=OLDEDITOR", "--rtf-editor", editor, "--script",
         tztest::scratch("edit.scr", "MTEDIT\n#2A\n").string(), "--save", after.string(),
         "--settings", tztest::scratch("settings.json", "{}").string(), before.string()});
    EXPECT_EQ(run.status, 0) << run.output << run.errors;
    return nlohmann::json::parse(tztest::bytesOf(after))["entities"][0]["contents"];
}

class WordProcessors : public testing::TestWithParam<ProcessorRow> {};

TEST_P(WordProcessors, KeepTheText) {
    std::string const program = GetParam().program;
    if (std::string const reason = reasonToSkip(program); !reason.empty()) GTEST_SKIP() << reason;
    fs::path const editor = tztest::sourceFolder() / "tests/edit/resave.sh";
    EXPECT_EQ(editedBy(editor.string() + " " + program, kMarkup), GetParam().contents);
}

INSTANTIATE_TEST_SUITE_P(Programs,
                         WordProcessors,
                         testing::ValuesIn(kProcessors),
                         [](auto const& row) { return row.param.program; });

// A text that comes back otherwise than as it was, and otherwise than from the module's own trip.
constexpr std::pair<char const*, char const*> kOtherwise[] = {
    {"{\\C2;\\c65535;WARNING} {\\C256;by layer} {\\C0;by block}\\P\\P",
     "{\\C2;WARNING} by layer {\\C0;by block}"},
    {"Sheet %<\\\\Var SHEET>% of 12, by %<\\\\Var AUTHOR>%", "Sheet #### of 12, by ####"},
};

// Each text of an office, all by one call of the slow program: a session writes the document, and
// another reads what became of it.
TEST(WordProcessor, KeepsOfficeTexts) {
    if (std::string const reason = reasonToSkip("soffice"); !reason.empty()) GTEST_SKIP() << reason;
    fs::path const folder = tztest::scratch("office");
    fs::remove_all(folder);
    fs::create_directories(folder / "back");
    std::ifstream file(tztest::sourceFolder() / "tests/markup/office.txt");
    std::vector<std::string> lines;
    for (std::string line; std::getline(file, line);) {
        if (!line.empty() && line[0] != ';') lines.push_back(line);
    }
    std::map<std::string, std::string> const otherwise(std::begin(kOtherwise),
                                                       std::end(kOtherwise));
    auto const documentOf = [](std::size_t at) { return std::to_string(at) + ".rtf"; };
    for (std::size_t at = 0; at < lines.size(); at += 3) {
        (void)editedBy("cp -t " + folder.string(), lines[at]);
        fs::rename(folder / "mtext.rtf", folder / documentOf(at));
    }
    std::string const where = folder.string();
    std::string const resave = "soffice -env:UserInstallation=file://" + where +
                               "/profile --headless --convert-to rtf --outdir " + where + "/back " +
                               where + "/*.rtf >" + where + "/log 2>&1";
    ASSERT_EQ(std::system(resave.c_str()), 0) << tztest::bytesOf(folder / "log");
    for (std::size_t at = 0; at < lines.size(); at += 3) {
        std::string const left =
            editedBy("cp " + (folder / "back" / documentOf(at)).string(), lines[at]);
        if (left == lines[at]) continue;
        auto const other = otherwise.find(lines[at]);
        EXPECT_EQ(left, other != otherwise.end() ? other->second : lines[at + 1]);
    }
}

}  // namespace
