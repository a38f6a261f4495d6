#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>

#include "apps/tzdraft/draft_program.h"
#include "tests/support/session_cases.h"

namespace {

namespace fs = std::filesystem;

// The program's own commands: what they leave in the drawing.
class HostCommands : public testing::TestWithParam<tztest::SessionCase> {};

TEST_P(HostCommands, LeaveInTheDrawing) {
    tztest::expectSession(GetParam());
}

INSTANTIATE_TEST_SUITE_P(Entities,
                         HostCommands,
                         testing::ValuesIn(tztest::readCases("host_commands/entities.txt")),
                         tztest::nameOfCase);
INSTANTIATE_TEST_SUITE_P(Undo,
                         HostCommands,
                         testing::ValuesIn(tztest::readCases("host_commands/undo.txt")),
                         tztest::nameOfCase);

// The texts and attributes in a new block used to lose their fields.
TEST(Blocks, TakeFieldsWithTheirTexts) {
    tzdraft::Options options;
    fs::path const folder(testing::TempDir());
    options.drawing = folder / "fields.json";
    options.script = (folder / "fields.scr").string();
    options.settings = folder / "fields-settings.json";
    options.save = folder / "fields-saved.json";
    options.module = fs::path(std::getenv("TZ_TEST_LIB")) / "tzmted.tzx";
    std::ofstream(options.drawing) << R"({"format":"tz-drawing","version":1,"layers":[],
        "textStyles":[],"blocks":[{"name":"A"}],"entities":[
        {"type":"MTEXT","contents":"0","field":"n=%<\\Var LUNITS>%"},
        {"type":"INSERT","block":"A","attributes":[
            {"type":"ATTRIB","tag":"T","text":"0","field":"a=%<\\Var LUPREC>%"}]}]})";
    std::ofstream(options.script) << "BLOCK\nB\n0,0\nall\n\n";
    std::ofstream(options.settings) << "{}";
    auto const ignore = [](std::string_view) {};
    EXPECT_EQ(tzdraft::runProgram(options, {ignore, ignore, nullptr}), tzdraft::kDone);
    std::ostringstream saved;
    saved << std::ifstream(options.save).rdbuf();
    for (char const* const expected : {R"("contents":"n=2")", R"("field":"n=%<\\Var LUNITS>%")",
                                       R"("text":"a=4")", R"("field":"a=%<\\Var LUPREC>%")"}) {
        EXPECT_NE(saved.str().find(expected), std::string::npos) << expected << saved.str();
    }
}

}  // namespace
