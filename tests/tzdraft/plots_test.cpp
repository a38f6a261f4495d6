// The page of a drawing, by PAGE, by its file and by options, and what the plots say.

#include <gtest/gtest.h>

#include "tests/support/program_run.h"

namespace {

using tztest::scratch;

struct PageRow {
    char const* name;
    char const* answers;
    char const* page;  // as the drawing's file holds it; "" for none
};
constexpr PageRow kPages[] = {
    {"ByEnter", "PAGE\n\n\n\n\n\n\n",
     R"("page":{"paper":"A4","landscape":true,"margin":10,"scale":null,"unit":"mm","window":null})"},
    {"AllAnswered", "PAGE\na3\np\n1:50\nM\n5.5\n10,20,0,0\n",
     R"("page":{"paper":"A3","landscape":false,"margin":5.5,"scale":[1,50],"unit":"m","window":[[0,0],[10,20]]})"},
    {"AnswersAreKept", "PAGE\n300x200\np\n1:2\nin\n0\n1,1,2,2\nPAGE\n\n\nfit\n\n\nall\n",
     R"("page":{"paper":"200x300","landscape":false,"margin":0,"scale":null,"unit":"in","window":null})"},
    {"WrongAnswerInAScript", "PAGE\nB5\n", ""},
    {"MarginWithoutRoom", "PAGE\nA4\n\n\n\n105\n", ""},
    {"TakenBack", "PAGE\nA3\n\n\n\n\n\nU\n", ""},
    {"CancelAtTheFirst", "PAGE\n^C\n", ""},
    {"CancelAtTheLast", "PAGE\nA3\n\n\n\n\n^C\n", ""},
};
class Pages : public testing::TestWithParam<PageRow> {};
TEST_P(Pages, AreKeptInTheDrawing) {
    std::string const script = scratch("page.scr", GetParam().answers).string();
    std::string const saved = scratch("page.json").string();
    tztest::ProgramRun const run = tztest::runProgram({"--script", script, "--save", saved});
    EXPECT_EQ(run.status, 0) << run.errors;
    std::string const bytes = tztest::bytesOf(saved);
    std::size_t const at = bytes.find("\"page\":");
    std::string const page =
        at == std::string::npos ? "" : bytes.substr(at, bytes.find('\n', at) - at - 1);
    EXPECT_EQ(page, GetParam().page) << run.output;
}
INSTANTIATE_TEST_SUITE_P(Rows, Pages, testing::ValuesIn(kPages), [](auto const& row) {
    return row.param.name;
});

TEST(Plots, GoToStandardOutputAlone) {
    std::string const script = scratch("line.scr", "LINE\n0,0\n1,1\n\n").string();
    tztest::ProgramRun const run = tztest::startProgram("--script " + script + " --svg -");
    EXPECT_EQ(run.status, 0);
    EXPECT_TRUE(run.output.starts_with("<?xml")) << run.output;
    EXPECT_TRUE(run.output.ends_with("</svg>\n")) << run.output;
    EXPECT_NE(run.errors.find("LINE"), std::string::npos) << run.errors;
    EXPECT_EQ(tztest::startProgram("--script " + script + " --pdf - 2>&1 >/dev/full #").status, 2);
}

TEST(Plots, LieAsPageAndOptionsSay) {
    std::string const drawing = scratch("a3.json", R"({"format": "tz-drawing", "version": 1,
        "page": {"paper": "A3"}, "entities": [{"type": "LINE", "end": [999, 0, 0]}]})")
                                    .string();
    std::string const pdf = scratch("a3.pdf").string();
    std::string const plotted = scratch("own.PDF").string();
    std::string const script = scratch("plot.scr", "PLOT\n" + plotted + "\n").string();
    tztest::ProgramRun const run = tztest::runProgram(
        {drawing, "--script", script, "--portrait", "--scale", "1:1", "--pdf", pdf});
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.errors, "tzdraft: " + pdf + ": what lies outside the page is left out\n");
    EXPECT_NE(run.output.find(plotted + ": what lies outside the page"), std::string::npos);
    for (std::string const& file : {pdf, plotted})
        EXPECT_NE(tztest::bytesOf(file).find("/MediaBox [ 0 0 841.8"), std::string::npos);
}

}  // namespace
