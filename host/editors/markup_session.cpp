#include "host/editors/markup_session.h"

#include "host/command_line/command_line.h"
#include "host/editors/markup_lines.h"
#include "host/editors/private_file.h"
#include "host/editors/program.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzhost {
namespace {

constexpr char kFileName[] = "mtext.txt";

// Prints why an editor's text was not taken, and where an edited one lies.
void refuse(std::string const& program,
            std::string const& problem,
            PrivateFile& file,
            std::string const& before) {
    TzString message = TzString::formatted(
        localText(L"The editor \"%ls\" %ls; the text stays as it was."),
        TzString::fromUtf8(program).kwszPtr(), TzString::fromUtf8(problem).kwszPtr());
    std::optional<std::string> const now = file.read();
    if (now && !now->empty() && *now != before) {
        file.keep();
        message += TzString::formatted(localText(L" What was edited is kept in %ls"),
                                       TzString::fromUtf8(file.path().string()).kwszPtr());
    }
    commandLine().say(message.str());
}

// What is wrong with the bytes that an editor left; empty when they can be taken.
std::string problemOf(std::optional<std::string> const& bytes) {
    if (!bytes) return localText("left a file that cannot be read");
    if (bytes->empty()) return localText("left an empty file");
    if (firstBadByte(*bytes) != kAllUtf8) return localText("left a file that is no UTF-8");
    if (bytes->find('\0') != std::string::npos)
        return localText("left a file with a zero character");
    return "";
}

std::optional<TzString> editWithProgram(TzString const& contents, std::string const& program) {
    // A line break at the end keeps editors that demand one quiet.
    std::string const before = TzString(markupToLines(contents.str())).toUtf8() + "\n";
    PrivateFile file(kFileName, before);
    if (!file.made()) {
        commandLine().say(
            localText(L"No file can be made for the editor; the text stays as it was."));
        return std::nullopt;
    }
    ProgramResult const result = runProgram(program, file.path());
    std::optional<std::string> const now = result.accepted ? file.read() : std::nullopt;
    std::string const problem = result.accepted ? problemOf(now) : result.problem;
    if (!problem.empty()) {
        refuse(program, problem, file, before);
        return std::nullopt;
    }
    if (*now != before) return TzString(linesToMarkup(TzString::fromUtf8(*now).str()));
    if (!contents.isEmpty()) return contents;
    // A new text of which nothing was written is no text.
    commandLine().say(localText(L"Nothing was written in the editor."));
    return std::nullopt;
}

}  // namespace

EditorConfiguration& editorConfiguration() {
    static EditorConfiguration configuration;
    return configuration;
}

std::optional<TzString> editMarkup(TzString const& contents, std::string const& program) {
    if (std::optional<EditorBlock> const block = commandLine().takeEditorBlock()) {
        if (!block->accepted) return std::nullopt;
        return TzString(linesToMarkup(block->text + L"\n"));
    }
    if (program.empty()) {
        commandLine().say(
            localText(L"No editor is named: --text-editor, the settings, $VISUAL or $EDITOR do."));
        return std::nullopt;
    }
    return editWithProgram(contents, program);
}

}  // namespace tzhost
