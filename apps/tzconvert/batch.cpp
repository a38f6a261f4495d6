#include "apps/tzconvert/batch.h"

#include <iconv.h>

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <new>
#include <set>
#include <stdexcept>
#include <utility>

#include "apps/tzconvert/conversion.h"
#include "apps/tzconvert/report.h"
#include "apps/tzconvert/streams.h"
#include "host/code_pages/code_page_table.h"
#include "host/files/file_bytes.h"
#include "host/files/file_reader.h"
#include "host/files/safe_file.h"
#include "host/fonts/font_map_path.h"
#include "host/settings/variables.h"

namespace tzconvert {
namespace {

namespace fs = std::filesystem;

void complain(std::string const& what) {
    std::fprintf(stderr, "tzconvert: %s\n", what.c_str());
}

bool isKnownPage(int codePage) {
    iconv_t const page = ::iconv_open("UTF-8", tzhost::iconvNameOf(codePage).c_str());
    bool const isKnown = page != reinterpret_cast<iconv_t>(-1);
    if (isKnown) ::iconv_close(page);
    return isKnown;
}

// The map is read again for each conversion, which a pipe cannot give.
Failure checkFontMap(std::string const& file) {
    std::error_code unknown;  // of a file that is not there, which opening it will tell
    if (fs::is_fifo(file, unknown)) return file + ": cannot be read: it is a pipe";
    tzhost::FileReader reader(file);
    char first = 0;
    (void)reader.read(&first, 1);  // a folder opens
    if (reader.hasFailed()) return file + ": cannot be read: " + tzhost::systemReason();
    return {};
}

// Puts the machine's settings in place; false when one cannot be used.
bool prepare(Options const& options) {
    if (!isKnownPage(options.codePage)) {
        complain("--code-page " + std::to_string(options.codePage) + " is not known");
        return false;
    }
    auto const page = L"ANSI_" + std::to_wstring(options.codePage);
    if (auto const written = tzhost::Variables::instance().overrideFromText(L"SYSCODEPAGE", page);
        !written.isDone()) {
        complain("--code-page cannot be set");
        return false;
    }
    if (options.fontMap.empty()) return true;
    if (Failure const failure = checkFontMap(options.fontMap)) {
        complain(*failure);
        return false;
    }
    tzhost::setFontMapFile(options.fontMap);
    return true;
}

// Where a file's result goes: in a folder, under its own name with the ending of the result. Empty
// for standard output.
std::string targetOf(Options const& options, std::string const& file) {
    if (options.outputDir.empty()) return options.output;
    fs::path name = file == "-" ? fs::path("stdin") : fs::path(file).filename();
    name.replace_extension(options.direction == Direction::toRtf ? ".rtf" : ".mtext");
    return (fs::path(options.outputDir) / name).string();
}

class Batch {
public:
    explicit Batch(Options const& options) : options_(options) {
        for (std::string const& file : options.files)
            if (file != "-") inputs_.insert(placeOf(file));
        if (!options.fontMap.empty()) inputs_.insert(placeOf(options.fontMap));
    }

    // The report takes the place of no input and of no result.
    [[nodiscard]] Failure checkReport() const {
        if (options_.report.empty() || options_.report == "-") return {};
        fs::path const place = placeOf(options_.report);
        if (inputs_.count(place) != 0) return "--report " + options_.report + ": it is an input";
        bool const isTarget =
            std::any_of(options_.files.begin(), options_.files.end(), [&](std::string const& file) {
                return placeOf(targetOf(options_, file)) == place;
            });
        if (isTarget) return "--report " + options_.report + ": a result goes there";
        return {};
    }

    [[nodiscard]] Failure convertFile(std::string const& file) {
        try {
            return convertUnguarded(file);
        } catch (std::bad_alloc const&) {
        } catch (std::length_error const&) {
        }
        return (file == "-" ? "standard input" : file) + ": memory cannot hold its conversion";
    }

    [[nodiscard]] Failure writeReport() const {
        if (options_.report.empty() || (reports_.empty() && options_.outputDir.empty())) return {};
        return writeBytes(options_.report == "-" ? "" : options_.report,
                          reportText(options_, reports_));
    }

private:
    [[nodiscard]] Failure convertUnguarded(std::string const& file) {
        std::string const target = targetOf(options_, file);
        if (!options_.outputDir.empty()) {
            if (Failure failure = checkTarget(file, target)) return failure;
        }
        std::wstring text;
        if (Failure failure = readText(file, text)) return failure;
        Converted const converted = convert(options_, std::move(text));
        if (Failure failure = writeText(target, converted.text)) return failure;
        targets_.insert(placeOf(target));
        reports_.push_back({file, converted.results});
        return {};
    }

    // The file itself, links followed, from the root even when it is not there.
    [[nodiscard]] static fs::path placeOf(std::string const& file) {
        std::error_code unreadable;  // will be named when it is read
        fs::path const named = fs::absolute(file, unreadable);
        fs::path const real = fs::weakly_canonical(tzhost::followLinks(named), unreadable);
        return unreadable ? named : real;
    }

    // A result takes the place of no input and of no other result; one that was not made has none.
    [[nodiscard]] Failure checkTarget(std::string const& file, std::string const& target) {
        fs::path const place = placeOf(target);
        if (inputs_.count(place) != 0)
            return file + ": its result would take the place of " + target;
        if (targets_.count(place) != 0)
            return file + ": " + target + " is another file's result already";
        return {};
    }

    Options const& options_;
    std::vector<FileReport> reports_;
    std::set<fs::path> inputs_;
    std::set<fs::path> targets_;  // the results that were written
};

}  // namespace

int run(Options const& options) {
    if (!prepare(options)) return kUnusable;
    Batch batch(options);
    if (Failure const failure = batch.checkReport()) {
        complain(*failure);
        return kUnusable;
    }
    int status = kDone;
    for (std::string const& file : options.files) {
        if (Failure const failure = batch.convertFile(file)) {
            complain(*failure);
            status = kUnusable;
        }
    }
    if (Failure const failure = batch.writeReport()) {
        complain(*failure);
        status = kUnusable;
    }
    return status;
}

}  // namespace tzconvert
