#include "apps/options/usage.h"

#include <algorithm>

#include "host/text/filled.h"
#include "host/text/local_text.h"
#include "host/text/near_words.h"
#include "host/text/utf8.h"

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

// The options of a command, with their dashes.
std::vector<std::wstring> optionNames(CLI::App const& command) {
    std::vector<std::wstring> names;
    for (CLI::Option const* const option : command.get_options()) {
        for (std::string const& name : option->get_lnames())
            names.push_back(tzhost::fromUtf8("--" + name));
    }
    return names;
}

std::string localProblem(CLI::ParseError const& wrong) {
    for (MessageRow const& row : kMessages) {
        if (wrong.get_exit_code() != static_cast<int>(row.kind)) continue;
        if (auto const parts = tzhost::partsOf(wrong.what(), row.message))
            return tzhost::filled(tzhost::localText(row.said), *parts);
    }
    return withLocalName(wrong.what());
}

}  // namespace

std::string problemWith(CLI::App const& command, CLI::ParseError const& wrong) {
    std::vector<std::string> const unknown = command.remaining();
    if (unknown.empty()) return localProblem(wrong);
    std::string const option = unknown.front().substr(0, unknown.front().find('='));
    return localProblem(wrong) + nearMiss(option, optionNames(command));
}

std::string nearMiss(std::string const& typed, std::vector<std::wstring> const& words) {
    std::wstring const near = tzhost::nearestWord(tzhost::fromUtf8(typed), words);
    if (near.empty()) return {};
    return tzhost::filled(tzhost::localText("; did you mean %s?"), {tzhost::toUtf8(near)});
}

}  // namespace tzapps
