// Editors that fail in each way: one line says why, no text is made, and what was written is kept.

#include <gtest/gtest.h>

#include "tests/support/program_run.h"

namespace {

namespace fs = std::filesystem;
using tztest::scratch;

struct EditorRow {
    char const* name;
    // The editor, a shell script whose $1 is the file; null for a program that is not there.
    char const* editor;
    // Part of the transcript.
    char const* said;
    // The contents of the text that is made; empty when none is.
    char const* made;
};
constexpr EditorRow kRows[] = {
    {"Missing", nullptr, "cannot be run: No such file", ""},
    {"Killed", "kill -9 $$", "was killed by signal 9; the text stays", ""},
    {"Failing", "exit 3", "ended with exit status 3; the text stays", ""},
    {"Emptying", ": > \"$1\"", "left an empty file; the text stays", ""},
    {"Removing", "rm \"$1\"", "left a file that cannot be read; the text", ""},
    {"Folder", "rm \"$1\"; mkdir \"$1\"", "left a file that cannot be read; the text", ""},
    {"NoUtf8", "printf 'a\\377' > \"$1\"", "left a file that is no UTF-8; the text", ""},
    {"Zero", "printf 'a\\000b' > \"$1\"", "left a file with a zero character", ""},
    {"Silent", ":", "Nothing was written in the editor.", ""},
    {"Slow", "sleep 1; echo late > \"$1\"", "Command: QUIT", "late"},
    {"Replacing", "echo new > n; mv n \"$1\"", "Command: QUIT", "new"},
    // It used to become part of the text.
    {"ByteOrder", "printf '\\357\\273\\277new\\n' > \"$1\"", "Command: QUIT", "new"},
    // It used to wait for a writer.
    {"Pipe", "rm \"$1\"; mkfifo \"$1\"", "left a file that cannot be read; the text", ""},
    {"WroteFailed", "echo kept > \"$1\"; kill -9 $$", "What was edited is kept in ", ""},
};
void PrintTo(EditorRow const& row, std::ostream* out) {
    *out << row.name;
}

// The contents of the drawing's texts.
std::vector<std::string> textsOf(fs::path const& drawing) {
    std::vector<std::string> texts;
    auto const json = nlohmann::json::parse(tztest::bytesOf(drawing));
    for (auto const& entity : json.at("entities")) {
        if (entity.at("type") == "MTEXT") texts.push_back(entity.at("contents"));
    }
    return texts;
}

// An empty temporary directory for the length of a test.
class TemporaryFolder {
public:
    TemporaryFolder() {
        fs::remove_all(folder_);
        fs::create_directories(folder_);
        setenv("TMPDIR", folder_.c_str(), 1);
    }
    TemporaryFolder(TemporaryFolder const&) = delete;
    TemporaryFolder& operator=(TemporaryFolder const&) = delete;
    ~TemporaryFolder() {
        setenv("TMPDIR", before_.c_str(), 1);
        fs::remove_all(folder_);
    }
    [[nodiscard]] std::ptrdiff_t files() const {
        return std::distance(fs::directory_iterator(folder_), {});
    }

private:
    fs::path folder_ = scratch("temporary");
    std::string before_ = fs::temp_directory_path();
};

class TextEditor : public testing::TestWithParam<EditorRow> {};

TEST_P(TextEditor, IsSurvived) {
    TemporaryFolder const temporary;
    std::string editor = scratch("nosuch").string();
    if (GetParam().editor)
        editor = "/bin/sh " + scratch("editor.sh", GetParam().editor + std::string("\n")).string();
    fs::path const script = scratch("note.scr", "MTEXT\n0,0\n40,-20\nQUIT\n");
    fs::path const drawing = scratch("note.json");
    tztest::ProgramRun const run =
        tztest::runProgram({"--script", script, "--save", drawing, "--text-editor", editor});
    EXPECT_EQ(run.status, tzdraft::kDone) << run.errors;
    EXPECT_NE(run.output.find(GetParam().said), std::string::npos) << run.output;
    std::vector<std::string> made;
    if (*GetParam().made) made.emplace_back(GetParam().made);
    EXPECT_EQ(textsOf(drawing), made);
    bool const isKept = run.output.find("What was edited is kept in ") != std::string::npos;
    EXPECT_EQ(temporary.files(), isKept ? 1 : 0);
}

// What was written before the editor died lies where the line says.
TEST(TextEditorKept, LiesWhereTheLineSays) {
    TemporaryFolder const temporary;
    std::string const editor =
        "/bin/sh " + scratch("editor.sh", "echo kept > \"$1\"; exit 1\n").string();
    fs::path const script = scratch("note.scr", "MTEXT\n0,0\n40,-20\nQUIT\n");
    tztest::ProgramRun const run =
        tztest::runProgram({"--script", script, "--text-editor", editor});
    std::string const lead = "is kept in ";
    std::size_t const at = run.output.find(lead);
    ASSERT_NE(at, std::string::npos) << run.output;
    std::size_t const first = at + lead.size();
    fs::path const file = run.output.substr(first, run.output.find('\n', first) - first);
    EXPECT_EQ(tztest::bytesOf(file), "kept\n") << file;
}

INSTANTIATE_TEST_SUITE_P(Rows, TextEditor, testing::ValuesIn(kRows), [](auto const& row) {
    return std::string(row.param.name);
});

}  // namespace
