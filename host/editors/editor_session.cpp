#include "host/editors/editor_session.h"

#include "host/base/memory_faults.h"
#include "host/command_line/command_line.h"
#include "host/editors/private_file.h"
#include "host/editors/program.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "tz/text/string.h"

namespace tzhost {
namespace {

// The end of a session in which the editor did not fail.
SessionEnd endOf(EditedText const& text, Taken taken) {
    if (taken == Taken::changed || !text.isEmpty()) return SessionEnd::accepted;
    commandLine().say(localText(L"Nothing was written in the editor."));
    return SessionEnd::left;
}

// One session of a program on a file.
class ProgramSession {
public:
    ProgramSession(EditedText& text, std::string const& program)
        : text_(text), program_(program), before_(text.bytes()), file_(text.fileName(), before_) {}

    SessionEnd run();

private:
    [[nodiscard]] TakenText takeFile();
    [[nodiscard]] bool keepsWork();
    void refuse(std::string const& problem);

    EditedText& text_;
    std::string const& program_;
    std::string before_;
    PrivateFile file_;
};

// Takes what the program left, if it left a text.
TakenText ProgramSession::takeFile() {
    ProgramResult result = runProgram(program_, file_.path());
    if (!result.accepted) return {Taken::refused, std::move(result.problem)};
    std::optional<std::string> const left = file_.read();
    if (!left) return {Taken::refused, localText("left a file that cannot be read")};
    if (left->empty()) return {Taken::refused, localText("left an empty file")};
    return text_.take(*left);
}

// Keeps the file when work may be in it: it was changed, or it cannot be read.
bool ProgramSession::keepsWork() {
    file_.keep();  // first, since looking into it takes memory that may not be there
    std::optional<std::string> const left = file_.read();
    bool const holdsWork = left ? !left->empty() && *left != before_ : file_.isThere();
    if (!holdsWork) file_.discard();
    return holdsWork;
}

// Prints why what the program left was not taken, and where it lies.
void ProgramSession::refuse(std::string const& problem) {
    TzString message = TzString::formatted(
        localText(L"The editor \"%ls\" %ls; the text stays as it was."),
        TzString::fromUtf8(program_).kwszPtr(), TzString::fromUtf8(problem).kwszPtr());
    if (keepsWork())
        message += TzString::formatted(localText(L" What was edited is kept in %ls"),
                                       TzString::fromUtf8(file_.path().string()).kwszPtr());
    commandLine().sayProblem(message.str());
}

SessionEnd ProgramSession::run() {
    if (!file_.made()) {
        commandLine().sayProblem(
            localText(L"No file can be made for the editor; the text stays as it was."));
        return SessionEnd::left;
    }
    TakenText result;
    try {
        result = takeFile();
    } catch (...) {  // memory ran short, perhaps after the program had written
        MemoryFaultPause const isSaid;
        refuse(localText("left a file that memory cannot hold"));
        throw;
    }
    if (result.taken != Taken::refused) return endOf(text_, result.taken);
    refuse(result.problem);
    return SessionEnd::left;
}

SessionEnd takeBlock(EditedText& text, EditorBlock const& block) {
    if (!block.accepted) return SessionEnd::left;
    TakenText const result = text.take(toUtf8(block.text) + "\n");
    if (result.taken != Taken::refused) return endOf(text, result.taken);
    commandLine().sayProblem(
        TzString::formatted(localText(L"The script %ls; the text stays as it was."),
                            TzString::fromUtf8(result.problem).kwszPtr())
            .str());
    return SessionEnd::left;
}

}  // namespace

SessionEnd runEditorSession(EditedText& text, EditorProgram const& program) {
    if (std::optional<EditorBlock> const block = commandLine().takeEditorBlock())
        return takeBlock(text, *block);
    if (!program.command.empty()) return ProgramSession(text, program.command).run();
    commandLine().sayProblem(program.lack);
    return SessionEnd::left;
}

}  // namespace tzhost
