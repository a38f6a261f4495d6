#include "apps/tzconvert/places.h"

#include <algorithm>

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

// The file itself, links followed, from the root even when it is not there.
Places::Place Places::placeOf(std::string const& file) {
    std::error_code unreadable;  // will be named when it is read
    Place const named = fs::absolute(file, unreadable);
    Place const real = fs::weakly_canonical(tzhost::followLinks(named), unreadable);
    return unreadable ? named : real;
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

}  // namespace tzconvert
