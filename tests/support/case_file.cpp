#include "tests/support/case_file.h"

#include <cstdlib>
#include <fstream>
#include <functional>
#include <map>
#include <ostream>
#include <stdexcept>

namespace tztest {

namespace {

std::filesystem::path pathOf(std::string const& file) {
    char const* root = std::getenv("TZ_TEST_SOURCE");
    return std::filesystem::path(root ? root : ".") / "tests" / file;
}

std::vector<std::string> linesOf(std::string const& file) {
    std::ifstream in(pathOf(file));
    if (!in) throw std::runtime_error(file + ": cannot be read");
    std::vector<std::string> lines;
    for (std::string line; std::getline(in, line);)
        lines.push_back(line);
    return lines;
}

// The text after a word and the blank that follows it.
std::string textAfter(std::string const& line, std::size_t word) {
    return line.size() > word + 1 ? line.substr(word + 1) : std::string();
}

// Reads a file from its first line to its last.
class Reader {
public:
    explicit Reader(std::string file) { common_.file = std::move(file); }

    std::vector<SessionCase> read() {
        int number = 0;
        for (std::string const& line : linesOf(common_.file)) {
            ++number;
            if (line.empty() || line.front() == '#') continue;
            if (!take(line)) {
                throw std::runtime_error(common_.file + ":" + std::to_string(number) +
                                         ": no such word");
            }
        }
        finishCase();
        return std::move(cases_);
    }

private:
    bool take(std::string const& line) {
        std::string const word = line.substr(0, line.find(' '));
        std::string const rest = textAfter(line, word.size());
        SessionCase& at = inCase_ ? current_ : common_;
        std::map<std::string, std::function<void()>> const words = {
            {"case", [&] { startCase(rest); }},
            {"from", [&] { at.from = std::stoi(rest); }},
            {"show", [&] { at.showsFrames = true; }},
            {"hide", [&] { at.hidden.push_back(rest); }},
            {"var", [&] { at.variables.push_back(rest); }},
            {"fail", [&] { at.faults.push_back(rest); }},
            {"settings", [&] { at.settings = rest; }},
            {"drawing", [&] { at.drawing = rest; }},
            {"patch", [&] { at.drawingPatch = rest; }},
            {"begin", [&] { common_.script.push_back(rest); }},
            {"end", [&] { end_.push_back(rest); }},
            {"stop", [&] { stops_ = true; }},
            {">", [&] { at.script.push_back(rest); }},
            {"|", [&] { at.expected.push_back(rest); }},
        };
        auto const found = words.find(word);
        if (found == words.end()) return false;
        found->second();
        return true;
    }

    void startCase(std::string const& name) {
        finishCase();
        current_ = common_;
        current_.name = name;
        inCase_ = true;
        stops_ = false;
    }

    void finishCase() {
        if (!inCase_) return;
        if (!stops_) current_.script.insert(current_.script.end(), end_.begin(), end_.end());
        cases_.push_back(current_);
    }

    SessionCase common_;
    SessionCase current_;
    std::vector<std::string> end_;
    std::vector<SessionCase> cases_;
    bool inCase_ = false;
    bool stops_ = false;
};

}  // namespace

std::vector<SessionCase> readCases(std::string const& file) {
    return Reader(file).read();
}

void storeExpectation(SessionCase const& changed, std::vector<std::string> const& lines) {
    std::string text;
    bool inCase = false;
    bool stored = false;
    auto const store = [&] {
        if (!inCase || stored) return;
        for (std::string const& line : lines)
            text += line.empty() ? "|\n" : "| " + line + "\n";
        stored = true;
    };
    for (std::string const& line : linesOf(changed.file)) {
        if (inCase && line.starts_with("|")) continue;
        if (line.empty() || line.starts_with("case ")) store();
        if (line.starts_with("case ")) inCase = line == "case " + changed.name;
        text += line + "\n";
    }
    store();
    std::ofstream(pathOf(changed.file), std::ios::binary) << text;
}

void PrintTo(SessionCase const& session, std::ostream* out) {
    *out << session.file << ", case " << session.name;
}

}  // namespace tztest
