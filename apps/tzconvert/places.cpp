#include "apps/tzconvert/places.h"

#include <algorithm>
#include <filesystem>

#include "apps/tzconvert/program_texts.h"

namespace tzconvert {

namespace fs = std::filesystem;

std::string targetOf(Options const& options, Input const& input) {
    if (options.outputDir.empty()) return options.output;
    return (fs::path(options.outputDir) / input.result).string();
}

Places::Places(Options const& options, std::vector<Input> const& inputs)
    : options_(options), files_(inputs) {
    for (Input const& each : inputs)
        inputs_.insert(paths_.of(each.file == "-" ? "/dev/stdin" : each.file));
    if (!options.fontMap.empty()) inputs_.insert(paths_.of(options.fontMap));
}

Failure Places::checkReport() {
    if (options_.report.empty() || options_.report == "-") return {};
    std::string const place = paths_.of(options_.report);
    if (inputs_.count(place) != 0)
        return filled(localText("--report %s: it is an input"), {options_.report});
    bool const isTarget = std::any_of(files_.begin(), files_.end(), [&](Input const& input) {
        return paths_.of(targetOf(options_, input)) == place;
    });
    if (isTarget) return filled(localText("--report %s: a result goes there"), {options_.report});
    return {};
}

std::string Places::placeOf(std::string const& target) {
    return target.empty() ? std::string() : paths_.of(target);
}

Failure
Places::checkTarget(std::string const& file, std::string const& target, std::string const& place) {
    if (place.empty()) return {};
    std::string const name = shownName(file);
    if (inputs_.count(place) != 0)
        return filled(localText("%s: its result would take the place of %s"), {name, target});
    if (targets_.count(place) != 0)
        return filled(localText("%s: %s is another file's result already"), {name, target});
    return {};
}

void Places::keep(std::string const& place) {
    if (!place.empty()) targets_.insert(place);
}

void Places::drop(std::string const& place) {
    targets_.erase(place);
}

}  // namespace tzconvert
