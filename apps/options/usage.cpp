#include "apps/options/usage.h"

#include <algorithm>

#include "host/text/filled.h"
#include "host/text/local_text.h"

namespace tzapps {
namespace {

using tzhost::forLocalText;

struct MessageRow {
    CLI::ExitCodes kind;
    char const* message;  // of the parser
    char const* said;     // in its place, with the same parts or the first of them
};
constexpr MessageRow kMessages[] = {
    {CLI::ExitCodes::ExtrasError, "The following argument was not expected: %s",
     forLocalText("The following argument was not expected: %s")},
    {CLI::ExitCodes::ExtrasError, "The following arguments were not expected: %s",
     forLocalText("The following arguments were not expected: %s")},
    {CLI::ExitCodes::ArgumentMismatch, "%s: 1 required %s missing",
     forLocalText("%s needs a value")},
    {CLI::ExitCodes::ArgumentMismatch, "%s: At Most 1 required but received %s",
     forLocalText("%s is given %s times, expected once")},
    {CLI::ExitCodes::RequiresError, "%s requires %s", forLocalText("%s requires %s")},
    {CLI::ExitCodes::ExcludesError, "%s excludes %s", forLocalText("%s excludes %s")},
    {CLI::ExitCodes::ConversionError, "Could not convert: %s = %s",
     forLocalText("%s cannot be \"%s\"")},
    {CLI::ExitCodes::ValidationError, "%s: Value %s not in range %s to %s",
     forLocalText("%s: %s is no number from %s to %s")},
    {CLI::ExitCodes::ValidationError, "%s: Directory does not exist: %s",
     forLocalText("%s: Directory does not exist: %s")},
    {CLI::ExitCodes::ValidationError, "%s: Directory is actually a file: %s",
     forLocalText("%s: Directory is actually a file: %s")},
};

constexpr char const* kArguments[] = {forLocalText("FILE"), forLocalText("DRAWING")};

// Arguments are called what the usage line calls them.
std::string withLocalName(std::string const& problem) {
    std::size_t const colon = std::min(problem.find(':'), problem.size());
    for (char const* const name : kArguments) {
        if (problem.substr(0, colon) == name)
            return tzhost::localText(name) + problem.substr(colon);
    }
    return problem;
}

}  // namespace

std::string problemWith(CLI::ParseError const& wrong) {
    for (MessageRow const& row : kMessages) {
        if (wrong.get_exit_code() != static_cast<int>(row.kind)) continue;
        if (auto const parts = tzhost::partsOf(wrong.what(), row.message))
            return tzhost::filled(tzhost::localText(row.said), *parts);
    }
    return withLocalName(wrong.what());
}

}  // namespace tzapps
