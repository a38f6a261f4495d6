#include "apps/tzdraft/file_options.h"

#include <CLI/CLI.hpp>
#include <cerrno>
#include <string>
#include <utility>
#include <vector>

#include "apps/tzdraft/program_texts.h"
#include "apps/tzdraft/start.h"
#include "host/files/file_kind.h"
#include "host/files/real_paths.h"
#include "host/text/filled.h"

namespace tzdraft {
namespace {

constexpr char kStandard[] = "-";
constexpr char kDrawing[] = "DRAWING";
constexpr char kSave[] = "--save";

struct NamedFile {
    std::string option;
    std::string name;  // empty for none
};

std::vector<NamedFile> filesRead(Options const& options) {
    bool const isNamed = !options.script.empty() && options.script != kStandard;
    return {
        {kDrawing, options.drawing.string()},
        {options.script.empty() ? localText("standard input") : "--script",
         isNamed ? options.script : "/dev/stdin"},
        {"--font-map", options.fontMap.string()},
        {"--module", options.module.string()},
        {"--resources", options.resources.string()},
    };
}

// The settings are read, too, and written at the end.
std::vector<NamedFile> filesWritten(Options const& options) {
    return {
        {"--settings", settingsFile(options)}, {kSave, options.save.string()},
        {"--svg", options.svg.string()},       {"--png", options.png.string()},
        {"--pdf", options.pdf.string()},       {"--events", options.events.string()},
    };
}

// Devices, pipes and standard output take any number of results.
bool isOfOne(NamedFile const& file) {
    return !file.name.empty() && file.name != kStandard &&
           (tzhost::isFile(file.name) || errno == ENOENT);
}

}  // namespace

void checkFiles(Options const& options) {
    for (auto const& [option, file] :
         {std::pair{kSave, &options.save}, std::pair{"--events", &options.events}}) {
        if (*file == kStandard)
            throw CLI::ValidationError(option, localText("it does not go to standard output"));
    }
    struct Place {
        std::string path;
        std::string option;
    };
    tzhost::RealPaths paths;
    std::vector<Place> places;
    for (NamedFile const& file : filesRead(options)) {
        if (isOfOne(file)) places.push_back({paths.of(file.name), file.option});
    }
    for (NamedFile const& file : filesWritten(options)) {
        if (!isOfOne(file)) continue;
        Place const place{paths.of(file.name), file.option};
        for (Place const& other : places) {
            bool const isSavedBack = place.option == kSave && other.option == kDrawing;
            if (other.path != place.path || isSavedBack) continue;
            throw CLI::ValidationError(
                place.option, tzhost::filled(localText("%s is the file of %s too"),
                                             {file.name, localText(other.option.c_str())}));
        }
        places.push_back(place);
    }
}

}  // namespace tzdraft
