// What the program does with what it cannot use: one line, its exit status, and the files that were
// there before stay.

#include <gtest/gtest.h>

#include <algorithm>
#include <sstream>

#include "tests/support/program_run.h"

namespace {

using tztest::scratch;

// Words of the command line, with {} for the folder of the scratch files.
struct BadRow {
    char const* name;
    char const* arguments;
    int status;
    char const* line;  // how the one line on standard error begins, after "tzdraft: "
};

// Arguments that are no arguments, in a process of their own.
constexpr BadRow kUsage[] = {
    {"UnknownOption", "--nonsense", 2, "The following argument was not expected: --nonsense"},
    {"NearOption", "--svae=p", 2,
     "The following argument was not expected: --svae=p; did you mean --save?"},
    {"ValueMissing", "--script", 2, "--script needs a value"},
    {"TwoDrawings", "a.json b.json", 2, "The following argument was not expected: b.json"},
    {"VariableMissing", "--script /dev/null --var", 2, "--var needs a value"},
    {"ResultNameless", "--png ''", 2, "--png: the file name is empty"},
    {"ScriptNameless", "--script ''", 2, "--script: the file name is empty"},
    {"DrawingNameless", "''", 2, "DRAWING: the file name is empty"},
    {"PaperUnknown", "--paper B5", 2, "--paper: \"B5\" is none, expected A0 to A4"},
    {"PaperOfNoSize", "--paper 0x10", 2, "--paper: \"0x10\" is none"},
    {"PaperWithoutRoom", "--paper a4 --margin 105", 2, "--paper: the margins leave nothing"},
    {"ScaleOfNothing", "--scale 1:0", 2, "--scale: \"1:0\" is none, expected fit, or N:M"},
    {"ScaleHuge", "--scale 1e300:1e-300", 2, "--scale: \"1e300:1e-300\" is none"},
    {"WindowOfNoSize", "--window -1,0,-1,5", 2, "--window: \"-1,0,-1,5\" is none"},
    {"WindowHuge", "--window -1e308,0,1e308,5", 2, "--window: \"-1e308,0,1e308,5\" is none"},
    {"UnitUnknown", "--unit yd", 2, "--unit: \"yd\" is none, expected mm, cm, m, in or ft"},
    {"MarginBelowZero", "--margin -1", 2, "--margin: \"-1\" is none"},
    {"DotsBelowOne", "--dpi 0", 2, "--dpi: \"0\" is none"},
    {"OrientationTwice", "--portrait --landscape", 2, "--portrait excludes --landscape"},
    {"OutputOfTwo", "--svg - --pdf -", 2, "-: standard output takes one plot alone"},
    {"ResultOverResult", "--save p.json --svg ./p.json", 2,
     "--svg: ./p.json is the file of --save"},
    {"ResultOverEvents", "--events p --png p", 2, "--events: p is the file of --png too"},
    {"ResultOverDrawing", "p --save p --pdf p", 2, "--pdf: p is the file of DRAWING too"},
    {"ResultInGerman", "--locale de p --pdf p", 2, "--pdf: p ist auch die Datei von ZEICHNUNG;"},
    {"ResultOverScript", "--script p --save p", 2, "--save: p is the file of --script too"},
    {"ResultOverFontMap", "--font-map p --save p", 2, "--save: p is the file of --font-map too"},
    {"ResultOverSettings", "--settings p --pdf p", 2, "--pdf: p is the file of --settings too"},
    {"DrawingToOutput", "--save -", 2, "--save: it does not go to standard output"},
    {"EventsToOutput", "--events -", 2, "--events: it does not go to standard output"},
    {"PictureOfAllSpaces", "--space all --png a.png", 2, "--space: only a PDF has a page"},
};

class WrongUsage : public testing::TestWithParam<BadRow> {};
TEST_P(WrongUsage, IsOneLineAndEndsWithTwo) {
    tztest::ProgramRun const run = tztest::startProgram(GetParam().arguments);
    EXPECT_EQ(run.status, GetParam().status);
    EXPECT_EQ(run.output, "");
    EXPECT_TRUE(run.errors.starts_with(std::string("tzdraft: ") + GetParam().line)) << run.errors;
    EXPECT_EQ(std::count(run.errors.begin(), run.errors.end(), '\n'), 1) << run.errors;
}
INSTANTIATE_TEST_SUITE_P(Rows, WrongUsage, testing::ValuesIn(kUsage), [](auto const& row) {
    return row.param.name;
});

TEST(Usage, HelpAndVersionEndWithZero) {
    for (char const* const asked : {"--help", "--version", "--script nosuch.scr --help"}) {
        tztest::ProgramRun const run = tztest::startProgram(asked);
        EXPECT_EQ(run.status, 0) << asked;
        EXPECT_NE(run.output, "") << asked;
        EXPECT_EQ(run.errors, "") << asked;
    }
    tztest::ProgramRun const full = tztest::startProgram("--help >/dev/full 2>&1 #");
    EXPECT_EQ(full.status, 2);
}

struct InputFile {
    char const* name;
    std::string bytes;
};

std::string drawing(std::string const& members) {
    return "{\"format\": \"tz-drawing\", \"version\": 1,\n" + members + "}\n";
}

std::string entity(std::string const& members) {
    return drawing("\"entities\": [\n{\"handle\": \"2A\", " + members + "}]");
}

std::vector<InputFile> const& inputFiles() {
    static std::vector<InputFile> const files{
        {"quit.scr", "QUIT\n"},
        {"latin.scr", "NEW\n;; gr\xFC\xDF\nQUIT\n"},
        {"cut.scr", "-MTEXT\n0,0\n"},
        {"block.scr", "NEW\n<<<\nabc\n>>>\nQUIT\n"},
        {"open.scr", "NEW\n<<<\nabc\n"},
        {"text.txt", "This is neither a module nor a library of texts.\n"},
        {"cut.json", "{\"format\": \"tz-drawing\",\n\"version\": 1,\n\"entities\": ["},
        {"newer.json", "{\"format\": \"tz-drawing\",\n\"version\": 2}"},
        {"type.json", entity("\"type\": \"MTEXT\", \"textHeight\": \"tall\"")},
        {"huge.json", entity("\"type\": \"CIRCLE\", \"radius\": 1e999")},
        {"layer.json", entity("\"type\": \"LINE\", \"layer\": \"Walls\"")},
        {"style.json", entity("\"type\": \"TEXT\", \"style\": \"Fancy\"")},
        {"latin.json", entity("\"type\": \"MTEXT\", \"contents\": \"gr\xFC\xDF\"")},
        {"twice.json", entity("\"type\": \"LINE\"},\n{\"handle\": \"2a\", \"type\": \"LINE\"")},
        {"settings.json", "{\"variables\": 5}"},
        {"save.scr", "SAVE\nnosuch/a.json\n"},
        {"plot.scr", "PLOT\na.gif\n"},
        {"save0.scr", "SAVE\n\n"},
        {"plot0.scr", "PLOT\n\n"},
        {"open0.scr", "OPEN\n\n"},
        {"load.scr", "LOAD\nnosuch/a.tzx\n"},
        {"lines.scr", "OPEN\nno\x1B\rsuch.json\n"},
    };
    return files;
}

// Nothing runs: neither drawing, nor plots, nor events are written.
constexpr BadRow kUnusable[] = {
    {"ScriptMissing", "--script {}/nosuch.scr", 2, "{}/nosuch.scr: the script cannot be read"},
    {"ScriptFolder", "--script {}", 2, "{}: the script cannot be read"},
    {"ScriptNotUtf8", "--script {}/latin.scr", 2, "{}/latin.scr:2: this line is not UTF-8"},
    {"DrawingMissing", "{}/nosuch.json", 2, "{}/nosuch.json: cannot be read"},
    {"DrawingCut", "{}/cut.json", 2, "{}/cut.json:3: "},
    {"DrawingNewer", "{}/newer.json", 2, "{}/newer.json:2: member \"version\": "},
    {"MemberType", "{}/type.json", 2, "{}/type.json:3: member \"textHeight\": "},
    {"MemberHuge", "{}/huge.json", 2, "{}/huge.json:3: member \"radius\": "},
    {"LayerUnknown", "{}/layer.json", 2, "{}/layer.json:3: member \"layer\": "},
    {"StyleUnknown", "{}/style.json", 2, "{}/style.json:3: member \"style\": "},
    {"DrawingNotUtf8", "{}/latin.json", 2, "{}/latin.json:3: member \"contents\": "},
    {"HandleTwice", "{}/twice.json", 2, "{}/twice.json:4: member \"handle\": "},
    {"SettingsMissing", "--settings {}/nosuch.json", 2, "--settings {}/nosuch.json: No such file"},
    {"SettingsWrong", "--settings {}/settings.json", 2, "--settings {}/settings.json:1: "},
    {"FontMapMissing", "--font-map {}/nosuch.ini", 2,
     "{}/nosuch.ini: the font map file cannot be read: No such"},
    {"ModuleLong", "--module {}/{long}", 2, "{}/{long}: the module cannot be loaded"},
    {"FontMapDevice", "--font-map /dev/zero", 2,
     "/dev/zero: the font map file cannot be read: it is a device or a pipe"},
    {"DrawingDevice", "/dev/zero", 2, "/dev/zero: cannot be read: it is a device or a pipe"},
    {"VariableUnknown", "--var NOSUCH=1", 2, "--var NOSUCH=1: There is no system"},
    {"VariableType", "--var LUNITS=two", 2, "--var LUNITS=two: LUNITS takes a whole"},
    {"VariableOutside", "--var LUNITS=6", 2, "--var LUNITS=6: LUNITS takes a whole"},
    {"VariableHuge", "--var TEXTSIZE=1e999", 2, "--var TEXTSIZE=1e999: TEXTSIZE takes a"},
    {"VariablePoint", "--var VIEWCTR=1", 2, "--var VIEWCTR=1: VIEWCTR takes a point"},
    {"VariableNoValue", "--var LUNITS", 2, "--var LUNITS: expected NAME=VALUE"},
    {"ModuleMissing", "--module {}/nosuch.tzx", 2,
     "{}/nosuch.tzx: the module cannot be loaded: cannot open shared object file: "
     "No such file or directory\n"},
    {"ScriptLong", "--script {long}", 2, "{long}: the script cannot be read: File name too long"},
    {"ModuleDamaged", "--module {}/text.txt", 2, "{}/text.txt: the module cannot be loaded"},
    {"ModuleOther", "--module {lib}/libtz.so.1", 2, "{lib}/libtz.so.1: this is no module"},
    {"ResourcesMissing", "--resources {}/nosuch.dll", 2,
     "{}/nosuch.dll: the resource library cannot be read: No such"},
    {"ResourcesDamaged", "--resources {}/text.txt", 2,
     "{}/text.txt: the resource library is damaged"},
    {"FaultCall", "--fail tzedGetPoint:x", 2, "--fail \"tzedGetPoint:x\": the call is"},
    {"FaultCallZero", "--fail tzedGetPoint:0", 2, "--fail \"tzedGetPoint:0\": the call is"},
    {"FaultStatus", "--fail tzedGetPoint=no", 2, "--fail \"tzedGetPoint=no\": the status"},
    {"FaultNameless", "--fail :2", 2, "--fail \":2\": the operation has no name"},
    {"EventsNowhere", "--events {}/nosuch/e.jsonl", 2,
     "{}/nosuch/e.jsonl: the events cannot be written: No such"},
};

// The run goes on or had its effect; the drawing is written as it then is.
constexpr BadRow kEarlyEnds[] = {
    {"InsideACommand", "--script {}/cut.scr", 1, "{}/cut.scr:2: the input ends inside a command"},
    {"BlockNotTaken", "--script {}/block.scr", 1, "{}/block.scr:2: no editor takes this block"},
    {"BlockNotEnded", "--script {}/open.scr", 1,
     "{}/open.scr:2: this block has no end, a line >>>"},
    {"SaveFails", "--script {}/save.scr", 1,
     "{}/save.scr:2: nosuch/a.json: cannot be written: No such file"},
    {"PlotFails", "--script {}/plot.scr", 1, "{}/plot.scr:2: a.gif: a plot's name ends in"},
    {"SaveNameless", "--script {}/save0.scr", 1, "{}/save0.scr:2: the file name is empty\n"},
    {"PlotNameless", "--script {}/plot0.scr", 1, "{}/plot0.scr:2: the file name is empty\n"},
    {"OpenNameless", "--script {}/open0.scr", 1, "{}/open0.scr:2: the file name is empty\n"},
    {"LoadFails", "--script {}/load.scr", 1, "{}/load.scr:2: /"},
    {"OpenFails", "--script {}/lines.scr", 1,
     "{}/lines.scr:2: no\\U+001B\\U+000Dsuch.json: cannot be read: No such file"},
};

constexpr char kOld[] = "as it was";
constexpr char const* kResults[] = {"kept.json", "kept.svg", "kept.png", "kept.pdf", "kept.jsonl"};

class BadInput : public testing::TestWithParam<BadRow> {
protected:
    BadInput() {
        for (InputFile const& file : inputFiles())
            scratch(file.name, file.bytes);
        for (char const* const result : kResults)
            scratch(result, kOld);
    }

    static std::string filled(std::string text) {
        std::pair<std::string, std::string> const places[] = {
            {"{}", scratch(".").parent_path().string()},
            {"{lib}", tztest::libraryFolder().string()},
            {"{long}", std::string(300, 'n')}};
        for (auto const& [mark, path] : places) {
            for (std::size_t at; (at = text.find(mark)) != std::string::npos;)
                text.replace(at, mark.size(), path);
        }
        return text;
    }

    // The row's words and every kind of result.
    static tztest::ProgramRun run(std::string const& line) {
        std::string const given = filled(line);
        std::string words = given;
        if (given.find("--script") == std::string::npos) words += filled(" --script {}/quit.scr");
        words +=
            filled(" --save {}/kept.json --svg {}/kept.svg --png {}/kept.png --pdf {}/kept.pdf");
        if (given.find("--events") == std::string::npos) words += filled(" --events {}/kept.jsonl");
        std::vector<std::string> arguments;
        std::istringstream split(words);
        for (std::string word; split >> word;)
            arguments.push_back(word);
        return tztest::runProgram(arguments);
    }

    static void expectOneLine(std::string const& errors, std::string const& start) {
        EXPECT_TRUE(errors.starts_with(filled(start))) << errors;
        EXPECT_EQ(std::count(errors.begin(), errors.end(), '\n'), 1) << errors;
    }
};

class Unusable : public BadInput {};
TEST_P(Unusable, IsOneLineAndLeavesTheOldFiles) {
    tztest::ProgramRun const ended = run(GetParam().arguments);
    EXPECT_EQ(ended.status, GetParam().status);
    expectOneLine(ended.errors, std::string("tzdraft: ") + GetParam().line);
    for (char const* const result : kResults) {
        EXPECT_TRUE(tztest::bytesOf(scratch(result)) == kOld) << result;
        EXPECT_FALSE(exists(scratch(std::string(result) + ".part"))) << result;
    }
}
INSTANTIATE_TEST_SUITE_P(Rows, Unusable, testing::ValuesIn(kUnusable), [](auto const& row) {
    return row.param.name;
});

class EarlyEnd : public BadInput {};
TEST_P(EarlyEnd, IsOneLineAndWritesTheDrawingAsItThenIs) {
    tztest::ProgramRun const ended = run(GetParam().arguments);
    EXPECT_EQ(ended.status, GetParam().status);
    expectOneLine(ended.errors, GetParam().line);
    EXPECT_NE(tztest::bytesOf(scratch("kept.json")).find("\"tz-drawing\""), std::string::npos);
    for (char const* const result : kResults)
        EXPECT_TRUE(tztest::bytesOf(scratch(result)) != kOld) << result;
    for (auto const& event : tztest::eventsOf(scratch("kept.jsonl"))) {
        if (event["event"] == "audit") {
            EXPECT_TRUE(tztest::isClean(event)) << event;
        }
    }
}
INSTANTIATE_TEST_SUITE_P(Rows, EarlyEnd, testing::ValuesIn(kEarlyEnds), [](auto const& row) {
    return row.param.name;
});

// A line that nobody can have meant is refused, and the question asks again.
TEST(LongLine, IsRefusedOnceAndTheQuestionAsksAgain) {
    std::string const longest(32768, 'x');
    auto const script = scratch("long.scr", "-MTEXT\n" + longest + "x\n^C\n" + longest +
                                                "x\nNEW\n" + longest + "\n");
    tztest::ProgramRun const run = tztest::runProgram({"--script", script.string()});
    EXPECT_EQ(run.status, 0);
    std::size_t refused = 0;
    for (std::size_t at = 0;
         (at = run.output.find("That line is too long.", at)) != std::string::npos; ++at)
        ++refused;
    EXPECT_EQ(refused, 2U) << run.output.substr(0, 2000);
    EXPECT_NE(run.output.find("There is no command \"xxx"), std::string::npos);
}

// The second --var used to be refused.
TEST(Options, TakeOneValueEachTime) {
    constexpr char const* kWords[] = {"tzdraft",   "--var",  "A=1", "--var",  "B=2",
                                      "plan.json", "--fail", "c",   "--fail", "d"};
    tzdraft::ParsedOptions const parsed = tzdraft::parseOptions(std::size(kWords), kWords);
    EXPECT_FALSE(parsed.exit);
    EXPECT_EQ(parsed.options.variables, (std::vector<std::string>{"A=1", "B=2"}));
    EXPECT_EQ(parsed.options.faults, (std::vector<std::string>{"c", "d"}));
    EXPECT_EQ(parsed.options.drawing, "plan.json");
}

}  // namespace
