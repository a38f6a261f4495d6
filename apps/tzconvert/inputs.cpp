#include "apps/tzconvert/inputs.h"

#include <algorithm>
#include <utility>

#include "apps/tzconvert/program_texts.h"
#include "host/text/system_words.h"

namespace tzconvert {
namespace {

namespace fs = std::filesystem;

// Whether a name has an ending of what is read.
bool isOne(Direction direction, fs::path const& file) {
    std::string ending = file.extension().string();
    for (char& c : ending) {
        if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
    }
    return readsRtf(direction) ? ending == ".rtf" : ending == ".mtext" || ending == ".txt";
}

class Walk {
public:
    Walk(Options const& options, Inputs& inputs) : options_(options), inputs_(inputs) {}

    void through(fs::path const& root) {
        folders_.push_back(root);
        while (!folders_.empty()) {
            fs::path const folder = std::move(folders_.back());
            folders_.pop_back();
            look(root, folder);
        }
    }

private:
    // Files before the folders below, each by name.
    void look(fs::path const& root, fs::path const& folder) {
        std::vector<fs::path> files;
        std::vector<fs::path> below;
        std::error_code problem;
        for (fs::directory_iterator at(folder, problem), end; !problem && at != end;
             at.increment(problem)) {
            if (at->path().filename().string().starts_with('.')) continue;
            std::error_code unseen;  // such an entry is no folder, and named when it is read
            if (at->is_directory(unseen)) {
                if (isBelow(*at)) below.push_back(at->path());
            } else if (isOne(options_.direction, at->path()) && !at->is_other(unseen)) {
                files.push_back(at->path());
            }
        }
        if (problem) {
            inputs_.failures.push_back(folder.string() + ": " + localText("cannot be read") + ": " +
                                       tzhost::systemWords(problem.value()));
        }
        std::sort(files.begin(), files.end());
        for (fs::path const& file : files)
            inputs_.files.push_back({file.string(), file.lexically_relative(root)});
        std::sort(below.begin(), below.end(), std::greater<>());
        folders_.insert(folders_.end(), below.begin(), below.end());
    }

    // Whether a folder in a folder is looked through.
    [[nodiscard]] bool isBelow(fs::directory_entry const& folder) const {
        std::error_code unseen;
        return !folder.is_symlink(unseen) &&
               !fs::equivalent(folder.path(), options_.outputDir, unseen);
    }

    Options const& options_;
    Inputs& inputs_;
    std::vector<fs::path> folders_;  // still to be looked at, the next one last
};

}  // namespace

Inputs inputsOf(Options const& options) {
    Inputs inputs;
    Walk walk(options, inputs);
    for (std::string const& file : options.files) {
        std::error_code unseen;  // will be named when it is read
        if (options.isRecursive && fs::is_directory(file, unseen)) {
            walk.through(file);
        } else {
            inputs.files.push_back({file, file == "-" ? "stdin" : fs::path(file).filename()});
        }
    }
    for (Input& each : inputs.files)
        each.result.replace_extension(endingOf(options.direction));
    return inputs;
}

}  // namespace tzconvert
