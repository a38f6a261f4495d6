#include "apps/tzdraft/help_topics.h"

#include <fstream>
#include <optional>
#include <vector>

#include "host/resources/language.h"
#include "host/resources/resource_search.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/module_linker.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

std::optional<std::wstring> topicIn(std::filesystem::path const& file, std::string const& topic) {
    std::ifstream lines(file);
    std::string line;
    std::string const heading = "[" + topic + "]";
    while (std::getline(lines, line) && line != heading) {
    }
    if (line != heading) return std::nullopt;
    std::string text;
    while (std::getline(lines, line) && !line.starts_with('['))
        text += line + "\n";
    text.erase(text.find_last_not_of('\n') + 1);
    return tzhost::fromUtf8(text);
}

// The help beside a module: in the language of the session, then in English.
std::vector<std::filesystem::path> helpFilesOf(std::filesystem::path const& module) {
    std::string const name = module.stem().string() + ".help";
    std::filesystem::path const folder = module.parent_path();
    std::vector<std::filesystem::path> files{folder / name};
    auto local = tzhost::translatedFile(folder, tzhost::resourceSearch().locale, name);
    if (local) files.insert(files.begin(), *std::move(local));
    return files;
}

}  // namespace

std::wstring helpFor(TzString const& name) {
    TzString const* const registered = tzhost::findHelp(name);
    TzString const& topic = registered ? *registered : name;
    for (auto const& module : tzhost::dynamicLinker().modules()) {
        for (std::filesystem::path const& file : helpFilesOf(module->file)) {
            if (auto const text = topicIn(file, topic.toUtf8())) return *text;
        }
    }
    return registered ? topic.str() : std::wstring();
}

}  // namespace tzdraft
