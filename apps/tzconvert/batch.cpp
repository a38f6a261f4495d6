#include "apps/tzconvert/batch.h"

#include <algorithm>
#include <new>
#include <stdexcept>
#include <utility>

#include "apps/tzconvert/conversion.h"
#include "apps/tzconvert/machine.h"
#include "apps/tzconvert/normalising.h"
#include "apps/tzconvert/places.h"
#include "apps/tzconvert/report.h"
#include "apps/tzconvert/streams.h"

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
    explicit Batch(Options const& options) : options_(options), places_(options) {}

    [[nodiscard]] Failure checkReport() const { return places_.checkReport(); }

    [[nodiscard]] Failure convertFile(std::string const& file) {
        try {
            return convertUnguarded(file);
        } catch (std::bad_alloc const&) {
        } catch (std::length_error const&) {
        }
        return shownName(file) + ": memory cannot hold its conversion";
    }

    [[nodiscard]] Failure writeReport() const {
        if (options_.report.empty() || (reports_.empty() && options_.outputDir.empty())) return {};
        return writeBytes(options_.report == "-" ? "" : options_.report,
                          reportText(options_, reports_));
    }

private:
    [[nodiscard]] Failure convertUnguarded(std::string const& file) {
        std::string const target = targetOf(options_, file);
        if (Failure failure = places_.checkTarget(file, target)) return failure;
        Converted converted;
        Failure const failure = options_.direction == Direction::normalise
                                    ? normaliseFile(file, target)
                                    : convertText(file, target, converted);
        if (failure) return failure;
        places_.keepTarget(target);
        reports_.push_back({file, converted.found});
        return {};
    }

    [[nodiscard]] Failure
    convertText(std::string const& file, std::string const& target, Converted& converted) const {
        std::wstring text;
        if (Failure failure =
                options_.normalises ? readNormalised(file, text) : readText(file, text))
            return failure;
        converted = convert(options_, std::move(text));
        return writeText(target, converted.text);
    }

    Options const& options_;
    Places places_;
    std::vector<FileReport> reports_;
};

}  // namespace

int run(Options const& options) {
    if (int const status = told(prepareMachine(options)); status != kDone) return status;
    Batch batch(options);
    if (int const status = told(batch.checkReport()); status != kDone) return status;
    int status = kDone;
    for (std::string const& file : options.files)
        status = std::max(status, told(batch.convertFile(file)));
    return std::max(status, told(batch.writeReport()));
}

}  // namespace tzconvert
