#include "apps/tzconvert/places.h"

#include <algorithm>
#include <filesystem>

#include "apps/tzconvert/program_texts.h"
#include "host/files/safe_file.h"

namespace tzconvert {

namespace fs = std::filesystem;

std::string targetOf(Options const& options, Input const& input) {
    if (options.outputDir.empty()) return options.output;
    return (fs::path(options.outputDir) / input.result).string();
}

Places::Places(Options const& options, std::vector<Input> const& inputs)
    : options_(options), files_(inputs) {
    for (Input const& each : inputs)
        inputs_.insert(placeOf(each.file == "-" ? "/dev/stdin" : each.file));
    if (!options.fontMap.empty()) inputs_.insert(placeOf(options.fontMap));
}

// Empty for a folder that is not there or cannot be looked at.
std::string const& Places::realFolder(std::string const& folder) const {
    if (auto const at = folders_.find(folder); at != folders_.end()) return at->second;
    std::error_code unreadable;
    fs::path const real = fs::canonical(folder.empty() ? "." : folder, unreadable);
    static std::string const kNone;  // a batch may make the folder yet
    return unreadable ? kNone : folders_.emplace(folder, real.string()).first->second;
}

// The file itself, links followed, from the root even when it is not there.
Places::Place Places::placeOf(std::string const& file) const {
    std::error_code unreadable;  // will be named when it is read
    fs::path const path(file);
    std::string const name = path.filename().string();
    bool const isPlain = !name.empty() && name != "." && name != "..";
    if (isPlain && !fs::is_symlink(path, unreadable)) {
        std::string const& folder = realFolder(path.parent_path().string());
        if (!folder.empty()) return (fs::path(folder) / name).string();
    }
    fs::path const named = fs::absolute(path, unreadable);
    fs::path const real = fs::weakly_canonical(tzhost::followLinks(named), unreadable);
    return unreadable ? named.string() : real.string();
}

Failure Places::checkReport() const {
    if (options_.report.empty() || options_.report == "-") return {};
    Place const place = placeOf(options_.report);
    if (inputs_.count(place) != 0)
        return filled(localText("--report %s: it is an input"), {options_.report});
    bool const isTarget = std::any_of(files_.begin(), files_.end(), [&](Input const& input) {
        return placeOf(targetOf(options_, input)) == place;
    });
    if (isTarget) return filled(localText("--report %s: a result goes there"), {options_.report});
    return {};
}

Failure Places::checkTarget(std::string const& file, std::string const& target) const {
    if (target.empty()) return {};
    std::string const name = shownName(file);
    Place const place = placeOf(target);
    if (inputs_.count(place) != 0)
        return filled(localText("%s: its result would take the place of %s"), {name, target});
    if (targets_.count(place) != 0)
        return filled(localText("%s: %s is another file's result already"), {name, target});
    return {};
}

void Places::keepTarget(std::string const& target) {
    if (!target.empty()) targets_.insert(placeOf(target));
}

void Places::dropTarget(std::string const& target) {
    targets_.erase(placeOf(target));
}

}  // namespace tzconvert
