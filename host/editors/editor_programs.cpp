#include "host/editors/editor_programs.h"

#include <cstdlib>
#include <filesystem>
#include <sstream>

#include <unistd.h>

#include "host/command_line/command_line.h"

namespace tzhost {
namespace {

// In the order in which they are tried. Systems that let the user choose an editor have the first.
constexpr char const* kUsualEditors[] = {"editor", "vi"};

bool isProgram(std::filesystem::path const& file) {
    std::error_code unreadable;  // as good as no file
    return std::filesystem::is_regular_file(file, unreadable) && access(file.c_str(), X_OK) == 0;
}

// The whole name of a program in the folders of $PATH; empty when there is none. A name with a
// blank or a quote would not be one word of a command, so that such a folder is passed over.
std::string findProgram(char const* name) {
    char const* const path = std::getenv("PATH");
    std::istringstream folders(path ? path : "");
    for (std::string folder; std::getline(folders, folder, ':');) {
        if (!folder.starts_with('/') || folder.find_first_of(" \t'\"") != std::string::npos)
            continue;
        std::filesystem::path const file = std::filesystem::path(folder) / name;
        if (isProgram(file)) return file.string();
    }
    return {};
}

}  // namespace

EditorConfiguration& editorConfiguration() {
    static EditorConfiguration configuration;
    return configuration;
}

std::string textEditorProgram() {
    std::string const& configured = editorConfiguration().textEditor;
    if (!configured.empty() || !commandLine().isPerson()) return configured;
    for (char const* const name : kUsualEditors) {
        if (std::string program = findProgram(name); !program.empty()) return program;
    }
    return {};
}

}  // namespace tzhost
