#include "tests/support/session_cases.h"

#include <algorithm>
#include <cstdlib>
#include <fstream>

#include "apps/tzdraft/draft_program.h"
#include "tests/support/event_lines.h"

namespace tztest {

namespace {

namespace fs = std::filesystem;

// Writes a text into the suite's own folder.
fs::path scratchFile(char const* name, std::string const& text) {
    char const* folder = std::getenv("TZ_TEST_SCRATCH");
    fs::path const file = fs::path(folder ? folder : ".") / name;
    std::ofstream(file, std::ios::binary) << text;
    return file;
}

std::string joined(std::vector<std::string> const& lines) {
    std::string text;
    for (std::string const& line : lines)
        text += line + "\n";
    return text;
}

std::string drawingOf(SessionCase const& session) {
    auto drawing = nlohmann::ordered_json::parse(session.drawing);
    if (!session.drawingPatch.empty())
        drawing.merge_patch(nlohmann::ordered_json::parse(session.drawingPatch));
    return drawing.dump();
}

tzdraft::Options optionsOf(SessionCase const& session) {
    tzdraft::Options options;
    options.script = scratchFile("session.scr", joined(session.script)).string();
    options.settings =
        scratchFile("settings.json", session.settings.empty() ? "{}" : session.settings);
    if (!session.drawing.empty()) options.drawing = scratchFile("drawing.json", drawingOf(session));
    options.variables = session.variables;
    options.faults = session.faults;
    options.events = scratchFile("events.jsonl", "");
    options.save = scratchFile("saved.json", "{\"entities\": []}");
    char const* library = std::getenv("TZ_TEST_LIB");
    if (library) options.module = fs::path(library) / "tzmted.tzx";
    return options;
}

}  // namespace

std::vector<std::string> runSession(SessionCase const& session) {
    tzdraft::Options const options = optionsOf(session);
    std::string errors;
    int const status = tzdraft::runProgram(
        options,
        {[](std::string_view) {}, [&errors](std::string_view text) { errors += text; }, nullptr});

    EventLines events(session.from,
                      session.showsFrames ? EventLines::Frames::shown : EventLines::Frames::left);
    std::ifstream stream(options.events);
    for (std::string line; std::getline(stream, line);)
        events.add(nlohmann::ordered_json::parse(line));
    std::vector<std::string> lines = events.lines();

    std::ifstream saved(options.save);
    for (std::string const& line : entityLines(nlohmann::ordered_json::parse(saved)))
        lines.push_back(line);
    if (status != 0) lines.push_back("exit " + std::to_string(status));
    std::erase_if(lines, [&](std::string const& line) {
        return std::any_of(session.hidden.begin(), session.hidden.end(),
                           [&](std::string const& start) { return line.starts_with(start); });
    });
    if (!errors.empty()) lines.push_back("error " + errors.substr(0, errors.find('\n')));
    return lines;
}

void expectSession(SessionCase const& session) {
    std::vector<std::string> const seen = runSession(session);
    if (std::getenv("TZ_TEST_ACCEPT")) {
        storeExpectation(session, seen);
        return;
    }
    EXPECT_EQ(joined(session.expected), joined(seen));
}

}  // namespace tztest
