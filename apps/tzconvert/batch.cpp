#include "apps/tzconvert/batch.h"

#include <algorithm>
#include <filesystem>
#include <new>
#include <stdexcept>
#include <utility>

#include <sys/stat.h>

#include "apps/tzconvert/conversion.h"
#include "apps/tzconvert/inputs.h"
#include "apps/tzconvert/machine.h"
#include "apps/tzconvert/normalising.h"
#include "apps/tzconvert/places.h"
#include "apps/tzconvert/program_texts.h"
#include "apps/tzconvert/report.h"
#include "apps/tzconvert/results.h"
#include "apps/tzconvert/streams.h"
#include "apps/tzconvert/warnings.h"
#include "host/text/system_words.h"

namespace tzconvert {
namespace {

// kDone, or kUnusable when there is a failure, which goes to standard error.
int told(Failure const& failure) {
    if (!failure) return kDone;
    tell(*failure);
    return kUnusable;
}

class Batch {
public:
    Batch(Options const& options, std::vector<Input> const& inputs)
        : options_(options), inputs_(inputs), places_(options, inputs) {}

    [[nodiscard]] Failure checkReport() { return places_.checkReport(); }
    // Converts all files, one after the other; the status.
    [[nodiscard]] int convertAll();
    [[nodiscard]] Failure writeReport() const;
    // How many files did what, where there are several.
    void summarise() const;

private:
    // A result that waits to take its place.
    struct Waiting {
        std::string place;
        FileReport report;
    };

    [[nodiscard]] int convertNext(Input const& input);
    [[nodiscard]] Failure convertFile(Input const& input, Warnings& warnings);
    [[nodiscard]] Failure convertUnguarded(Input const& input, Warnings& warnings);
    [[nodiscard]] int settle();
    [[nodiscard]] Failure convertText(std::string const& file,
                                      std::string const& target,
                                      Converted& converted,
                                      Warnings& warnings);
    [[nodiscard]] Failure
    normalise(std::string const& file, std::string const& target, Warnings& warnings);
    [[nodiscard]] Failure makeFolderOf(std::string const& target) const;
    void tellWarnings(std::string const& file, Warnings const& warnings);

    Options const& options_;
    std::vector<Input> const& inputs_;
    Places places_;
    FontTables fonts_;
    Results results_;
    std::vector<Waiting> waiting_;
    std::vector<FileReport> reports_;  // of results that have their places
    int warned_ = 0;                   // files
};

// Whether a file is read and converted in less time than a person waits for Ctrl-C.
bool isQuick(std::string const& file) {
    constexpr off_t kMost = 1 << 20;
    struct stat status {};
    return stat(file.c_str(), &status) == 0 && S_ISREG(status.st_mode) && status.st_size <= kMost;
}

int Batch::convertAll() {
    int status = kDone;
    for (Input const& input : inputs_)
        status = std::max(status, convertNext(input));
    status = std::max(status, settle());
    bool const isError = warned_ > 0 && options_.warningsAreErrors;
    return std::max(status, isError ? kWarned : kDone);
}

// Results wait for others only as long as these come at once.
int Batch::convertNext(Input const& input) {
    int status = results_.areDue() || !isQuick(input.file) ? settle() : kDone;
    Warnings warnings;
    status = std::max(status, told(convertFile(input, warnings)));
    tellWarnings(input.file, warnings);
    return status;
}

int Batch::settle() {
    int status = kDone;
    std::vector<Waiting> waiting;
    waiting.swap(waiting_);
    std::size_t at = 0;
    for (Failure const& failure : results_.settle()) {
        Waiting& result = waiting[at++];
        if (failure)
            places_.drop(result.place);
        else
            reports_.push_back(std::move(result.report));
        status = std::max(status, told(failure));
    }
    return status;
}

void Batch::tellWarnings(std::string const& file, Warnings const& warnings) {
    if (!warnings.empty()) ++warned_;
    if (options_.isQuiet) return;
    for (std::string const& warning : warnings)
        tell(shownName(file) + localText(": warning: ") + warning);
}

void Batch::summarise() const {
    if (inputs_.size() < 2 || options_.isQuiet) return;
    std::size_t const failed = inputs_.size() - reports_.size();
    std::string text = filled(localText("%s of %s files converted"),
                              {std::to_string(reports_.size()), std::to_string(inputs_.size())});
    if (failed > 0) text += filled(localText(", %s failed"), {std::to_string(failed)});
    if (warned_ > 0) text += filled(localText(", %s with warnings"), {std::to_string(warned_)});
    tell(text);
}

Failure Batch::convertFile(Input const& input, Warnings& warnings) {
    try {
        return convertUnguarded(input, warnings);
    } catch (std::bad_alloc const&) {
    } catch (std::length_error const&) {
    }
    return shownName(input.file) + ": " + localText("memory cannot hold its conversion");
}

Failure Batch::convertUnguarded(Input const& input, Warnings& warnings) {
    std::string const target = targetOf(options_, input);
    std::string const place = places_.placeOf(target);
    if (Failure failure = places_.checkTarget(input.file, target, place)) return failure;
    if (Failure failure = makeFolderOf(target)) return failure;
    Waiting result{place, {input.file, {}}};
    waiting_.reserve(waiting_.size() + 1);  // nothing fails between the writing and the list
    Converted converted;
    Failure const failure = options_.direction == Direction::normalise
                                ? normalise(input.file, target, warnings)
                                : convertText(input.file, target, converted, warnings);
    if (failure) return failure;
    result.report.found = converted.found;
    if (target.empty()) {
        reports_.push_back(std::move(result.report));
        return {};
    }
    waiting_.push_back(std::move(result));
    places_.keep(place);
    return {};
}

// What came from below a folder goes below the folder of the results.
Failure Batch::makeFolderOf(std::string const& target) const {
    if (!options_.isRecursive) return {};
    std::error_code problem;
    std::filesystem::create_directories(std::filesystem::path(target).parent_path(), problem);
    if (!problem) return {};
    return notWritten(target, tzhost::systemWords(problem.value()));
}

Failure Batch::convertText(std::string const& file,
                           std::string const& target,
                           Converted& converted,
                           Warnings& warnings) {
    std::wstring text;
    if (Failure failure =
            options_.normalises ? readNormalised(file, text, warnings) : readText(file, text))
        return failure;
    if (!options_.normalises) addLook(warnings, options_.direction, text);
    converted = convert(options_, fonts_, std::move(text));
    addIncidents(warnings, converted.found);
    // What the normaliser writes is the converter's own, and so is what a round trip reads.
    if (options_.direction == Direction::toMtext && !options_.normalises)
        addLosses(warnings, converted.losses);
    return results_.write(target, std::wstring_view(converted.text));
}

Failure Batch::normalise(std::string const& file, std::string const& target, Warnings& warnings) {
    std::string document;
    if (Failure failure = readNormalised(file, document, warnings)) return failure;
    return results_.write(target, std::string_view(document));
}

Failure Batch::writeReport() const {
    if (options_.report.empty() || (reports_.empty() && options_.outputDir.empty())) return {};
    return writeBytes(options_.report == "-" ? "" : options_.report,
                      reportText(options_, reports_));
}

}  // namespace

int run(Options const& options) {
    if (int const status = told(prepareMachine(options)); status != kDone) return status;
    Inputs const inputs = inputsOf(options);
    Batch batch(options, inputs.files);
    if (int const status = told(batch.checkReport()); status != kDone) return status;
    int status = kDone;
    for (std::string const& failure : inputs.failures)
        status = told(failure);
    status = std::max(status, batch.convertAll());
    batch.summarise();
    return std::max(status, told(batch.writeReport()));
}

}  // namespace tzconvert
