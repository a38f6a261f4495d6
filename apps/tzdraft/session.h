#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "host/database/drawing.h"
#include "host/display/plot.h"

// One run of the program: the drawing that is open, and what the commands of the program do with
// it. Every operation that can fail says why in one line, with the file in it.
namespace tzdraft {

class Session {
public:
    Session();
    Session(Session const&) = delete;
    Session& operator=(Session const&) = delete;
    ~Session();

    // The running session, which the bodies of the program's commands work on.
    [[nodiscard]] static Session& current();

    // An empty drawing in place of the one that is open.
    void makeNew();
    // Another drawing in place of it; on failure the drawing stays.
    [[nodiscard]] bool open(std::filesystem::path const& file, std::string& error);
    // The open drawing to a file, whole or not at all.
    [[nodiscard]] bool save(std::filesystem::path const& file, std::string& error);
    // The active space as a picture; the file's ending (.svg, .png, .pdf) says which.
    [[nodiscard]] bool plot(std::filesystem::path const& file, std::string& error) const;
    // The same with the kind of picture given.
    [[nodiscard]] bool
    plotAs(tzhost::PlotFormat format, std::filesystem::path const& file, std::string& error) const;
    // The open drawing; there is always one once makeNew or open was called.
    [[nodiscard]] tzhost::Drawing& drawing() const { return *drawing_; }

    // A command wants the session to end.
    void quit() { wantsToEnd_ = true; }
    [[nodiscard]] bool wantsToEnd() const { return wantsToEnd_; }

    // Begin and end of a command, for undo.
    void beginCommand();
    void endCommand();

private:
    void replaceBy(std::unique_ptr<tzhost::Drawing> drawing);

    std::unique_ptr<tzhost::Drawing> drawing_;
    // Drawings that a command has replaced live until that command has ended.
    std::vector<std::unique_ptr<tzhost::Drawing>> retired_;
    bool isInCommand_ = false;
    bool wantsToEnd_ = false;
};

}  // namespace tzdraft
