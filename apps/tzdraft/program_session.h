#pragma once

#include <deque>
#include <filesystem>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "apps/tzdraft/own_files.h"
#include "host/database/drawing.h"
#include "host/display/plot.h"
#include "host/files/safe_file.h"
#include "host/settings/variables.h"

// One run of the program: the drawing that is open, and what the commands of the program do with
// it. Every operation that can fail says why in one line, with the file in it.
namespace tzdraft {

class ProgramSession {
public:
    ProgramSession();
    ProgramSession(ProgramSession const&) = delete;
    ProgramSession& operator=(ProgramSession const&) = delete;
    ~ProgramSession();

    // The running session, which the bodies of the program's commands work on.
    [[nodiscard]] static ProgramSession& current();

    // An empty drawing in place of the one that is open.
    void makeNew();
    // The same for a file that is not there yet, which SAVE then proposes.
    void makeNew(std::filesystem::path const& file);
    // Another drawing in place of it; on failure the drawing stays.
    [[nodiscard]] bool open(std::filesystem::path const& file, std::string& error);
    // The open drawing to a file, whole or not at all.
    [[nodiscard]] bool save(std::filesystem::path const& file,
                            std::string& error,
                            tzhost::IfReadOnly ifReadOnly = tzhost::IfReadOnly::refuse);
    // What stands above the drawing's page in each plot, and the space that is plotted.
    void setPlotting(tzhost::PageChoice const& page, tzhost::PlotSpace space);
    // The drawing as a picture; the file's ending (.svg, .png, .pdf, in any case) says which.
    // `remarks` are lines about what the picture lacks.
    [[nodiscard]] bool plot(std::filesystem::path const& file,
                            std::string& error,
                            std::vector<std::string>& remarks,
                            tzhost::IfReadOnly ifReadOnly = tzhost::IfReadOnly::refuse);
    // The same with the kind of picture given.
    [[nodiscard]] bool plotAs(tzhost::PlotFormat format,
                              std::filesystem::path const& file,
                              std::string& error,
                              std::vector<std::string>& remarks,
                              tzhost::IfReadOnly ifReadOnly = tzhost::IfReadOnly::refuse);
    // The open drawing; there is always one once makeNew or open was called.
    [[nodiscard]] tzhost::Drawing& drawing() const { return *drawing_; }

    // The file that the drawing is written to at the end of the session anyway; empty for none.
    void saveAtEnd(std::filesystem::path file) { fileAtEnd_ = std::move(file); }
    [[nodiscard]] std::filesystem::path const& fileAtEnd() const { return fileAtEnd_; }
    // The names of the drawings with changes that no file holds: the open one, and those that undo
    // can bring back.
    [[nodiscard]] std::vector<std::wstring> unsaved() const;
    // The name of the drawing with such changes that the next new one would push out of undo's
    // reach; empty for none.
    [[nodiscard]] std::wstring unsavedToDrop() const;
    [[nodiscard]] OwnFiles const& ownFiles() const { return ownFiles_; }

    // A command wants the session to end.
    void quit() { wantsToEnd_ = true; }
    [[nodiscard]] bool wantsToEnd() const { return wantsToEnd_; }

    // Takes the last command back; one that replaced the drawing, too, by bringing the drawing
    // before it back. The name of that command; nothing when there is none.
    [[nodiscard]] std::optional<std::wstring> undo();
    // Does again what undo took back last, as long as nothing else has changed a drawing since.
    [[nodiscard]] std::optional<std::wstring> redo();

    // The file name of the module that LOAD proposes.
    void setModule(std::filesystem::path module) { module_ = std::move(module); }
    [[nodiscard]] TzString moduleName() const;
    [[nodiscard]] std::filesystem::path moduleFolder() const { return module_.parent_path(); }
    // A name without a slash is looked for beside the proposed module alone: the working folder may
    // hold a stranger's files.
    [[nodiscard]] std::filesystem::path moduleCalled(std::filesystem::path const& name) const;
    // Modules come and go between commands, since the one that asks for it may be a module's.
    void loadLater(std::filesystem::path const& name);
    void unloadLater();

    // Begin and end of a command, or of a call of a function; undo names it so.
    void beginCommand(std::wstring name);
    void endCommand();
    // Does what was asked for the time after the command.
    void doPostponed();

private:
    // A drawing that another took the place of, with its variables and the command that did it.
    struct Replaced {
        std::unique_ptr<tzhost::Drawing> drawing;
        tzhost::Variables::Snapshot variables;
        std::wstring command;
    };
    using ReplacedDrawings = std::deque<Replaced>;

    void replaceBy(std::unique_ptr<tzhost::Drawing> drawing,
                   std::function<void()> const& setVariables);
    // The same, and undo can bring the present drawing back.
    void replaceForUndo(std::unique_ptr<tzhost::Drawing> drawing,
                        std::function<void()> const& setVariables);
    // The last drawing of `from` in place of the open one, which goes to the end of `to`.
    std::optional<std::wstring> pass(ReplacedDrawings& from, ReplacedDrawings& to);

    std::unique_ptr<tzhost::Drawing> drawing_;
    ReplacedDrawings replaced_;   // for undo, the newest last
    ReplacedDrawings takenBack_;  // for redo, the next one last
    // Drawings that a command has done away with live until that command has ended.
    std::vector<std::unique_ptr<tzhost::Drawing>> retired_;
    std::vector<std::function<void()>> postponed_;
    OwnFiles ownFiles_;
    std::filesystem::path module_;
    std::filesystem::path fileAtEnd_;
    std::wstring command_;  // the one that runs
    tzhost::PageChoice page_;
    tzhost::PlotSpace space_ = tzhost::PlotSpace::active;
    bool isInCommand_ = false;
    bool wantsToEnd_ = false;
};

}  // namespace tzdraft
