#include "apps/tzdraft/help_topics.h"

#include <fstream>
#include <optional>

#include "host/base/utf8.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/module_linker.h"

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

}  // namespace

std::wstring helpFor(TzString const& name) {
    tzhost::HelpTopic const* const help = tzhost::findHelp(name);
    TzString const& topic = help ? help->topic : name;
    for (auto const& module : tzhost::dynamicLinker().modules()) {
        std::filesystem::path file = module->file;
        auto const text = topicIn(file.replace_extension(".help"), topic.toUtf8());
        if (text) return *text;
    }
    return help ? topic.str() : std::wstring();
}

}  // namespace tzdraft
