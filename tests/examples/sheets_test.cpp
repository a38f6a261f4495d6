// Every script of examples/ as a drafter runs it, on the drawing beside it if there is one: its
// drawing, what passed between module and host, its audit, and that the saved drawing opens and
// saves as the same bytes.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <set>

#include "tests/support/event_lines.h"
#include "tests/support/program_run.h"

namespace {

namespace fs = std::filesystem;
using Json = nlohmann::ordered_json;
using tztest::scratch;

std::vector<fs::path> scripts() {
    std::vector<fs::path> found;
    for (auto const& entry : fs::directory_iterator(tztest::sourceFolder() / "examples"))
        if (entry.path().extension() == ".scr") found.push_back(entry.path());
    std::sort(found.begin(), found.end());
    return found;
}

std::string nameOf(testing::TestParamInfo<fs::path> const& row) {
    std::string name = row.param.stem().string();
    std::erase(name, '-');
    return name;
}

// The arguments that play a script, on the drawing beside it if there is one.
std::vector<std::string> played(fs::path const& script, std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), {"--script", script.string()});
    fs::path const start = fs::path(script).replace_extension(".json");
    if (fs::exists(start)) arguments.insert(arguments.begin(), start.string());
    return arguments;
}

fs::path expectationOf(fs::path const& script) {
    return tztest::sourceFolder() / "tests/examples" / (script.stem().string() + ".txt");
}

// The size of a laid out text, to what different versions of a font agree on.
std::string measured(Json const& entity) {
    if (!entity.contains("measured") || !entity["measured"].contains("width")) return {};
    char text[80];
    std::snprintf(text, sizeof text, "  measured %.2f by %.2f\n",
                  entity["measured"]["width"].get<double>(),
                  entity["measured"]["height"].get<double>());
    return text;
}

// What a drafter would check of a drawing.
std::string printed(Json const& drawing) {
    std::string text;
    for (Json const& layer : drawing["layers"])
        text += "layer " + layer["name"].get<std::string>() + "\n";
    for (Json const& style : drawing["textStyles"])
        text += "style " + style["name"].get<std::string>() + ": " +
                style["typeface"].get<std::string>() + style["fontFile"].get<std::string>() + "\n";
    std::vector<std::string> const lines = tztest::entityLines(drawing);
    for (std::size_t at = 0; at < lines.size(); ++at)
        text += lines[at] + "\n" + measured(drawing["entities"][at]);
    return text;
}

// What passed between the text module and the host while its commands ran.
std::string printed(std::vector<Json> const& events) {
    std::set<std::string> commands;
    std::string command;
    tztest::EventLines lines(0, tztest::EventLines::Frames::shown);
    for (Json const& event : events) {
        // A preview of an alignment is where its texts will stand, those of the others are strokes.
        if (event["event"] == "frame" && command != "TEXTALIGN") continue;
        if (event.value("group", "") == "TZCORE_MTEXT") commands.insert(event["name"]);
        if (event["event"] == "command") command = event["phase"] == "begin" ? event["name"] : "";
        if (commands.contains(command)) lines.add(event);
    }
    std::string text = "\nevents\n";
    for (std::string const& line : lines.lines())
        text += line + "\n";
    return text;
}

class Sheets : public testing::TestWithParam<fs::path> {};

TEST_P(Sheets, GiveTheirDrawing) {
    fs::path const saved = scratch("sheet.json");
    tztest::ProgramRun const run = tztest::runProgram(
        played(GetParam(), {"--strict", "--save", saved.string(), "--svg",
                            scratch("sheet.svg").string(), "--png", scratch("sheet.png").string(),
                            "--events", scratch("sheet.jsonl").string()}));
    ASSERT_EQ(run.status, 0) << run.output;
    EXPECT_EQ(run.errors, "");

    std::vector<Json> const events = tztest::eventsOf(scratch("sheet.jsonl"));
    std::string const seen = printed(Json::parse(tztest::bytesOf(saved))) + printed(events);
    if (std::getenv("TZ_TEST_ACCEPT")) {
        std::ofstream(expectationOf(GetParam()), std::ios::binary) << seen;
    } else {
        EXPECT_EQ(tztest::bytesOf(expectationOf(GetParam())), seen);
    }

    int audits = 0;
    for (Json const& event : events) {
        if (event["event"] != "audit") continue;
        ++audits;
        EXPECT_TRUE(tztest::isClean(event)) << event;
    }
    EXPECT_GT(audits, 0);
    EXPECT_TRUE(tztest::bytesOf(scratch("sheet.png")).starts_with("\x89PNG"));
    EXPECT_NE(tztest::bytesOf(scratch("sheet.svg")).find("<path"), std::string::npos);
}

TEST_P(Sheets, OpenAndSaveAsTheSameBytes) {
    std::string const first = scratch("first.json").string();
    std::string const second = scratch("second.json").string();
    EXPECT_EQ(tztest::runProgram(played(GetParam(), {"--save", first})).status, 0);
    EXPECT_EQ(tztest::runProgram({first, "--script", "/dev/null", "--save", second}).status, 0);
    EXPECT_NE(tztest::bytesOf(first), "");
    EXPECT_TRUE(tztest::bytesOf(first) == tztest::bytesOf(second));
}

INSTANTIATE_TEST_SUITE_P(Scripts, Sheets, testing::ValuesIn(scripts()), nameOf);

}  // namespace
