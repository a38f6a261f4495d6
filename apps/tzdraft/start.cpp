#include "apps/tzdraft/start.h"

#include <cstdlib>

#include "apps/options/language.h"
#include "apps/tzdraft/program_texts.h"
#include "host/command_line/command_line.h"
#include "host/editors/editor_programs.h"
#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"
#include "host/fonts/font_map_path.h"
#include "host/resources/language.h"
#include "host/resources/resource_search.h"
#include "host/settings/settings.h"
#include "host/settings/variables.h"
#include "host/text/utf8.h"
#include "tz/text/string.h"

namespace tzdraft {
namespace {

constexpr char kModuleName[] = "tzmted.tzx";
constexpr wchar_t kResourceName[] = L"TzmtedRes.dll";

// The first that says something.
std::string firstOf(std::initializer_list<std::string> candidates) {
    for (std::string const& each : candidates) {
        if (!each.empty()) return each;
    }
    return {};
}

std::string environment(char const* name) {
    char const* const value = std::getenv(name);
    return value ? value : "";
}

// Settings that cannot be used are reported, and the defaults hold.
bool loadSettings(Options const& options, SettingsState& state, std::string& error) {
    tzhost::settings() = tzhost::Settings();
    bool const isNamed = !options.settings.empty();
    auto const problem = tzhost::loadSettings(
        settingsFile(options), isNamed ? tzhost::IfMissing::fail : tzhost::IfMissing::useDefaults);
    state = problem ? SettingsState::unusable : SettingsState::usable;
    if (!problem) return true;
    if (isNamed) {
        error = "--settings " + *problem;
    } else {
        tzhost::commandLine().say(tzhost::fromUtf8(*problem));
    }
    return !isNamed;
}

bool setVariables(Options const& options, std::string& error) {
    tzhost::Variables& variables = tzhost::Variables::instance();
    for (std::string const& each : options.variables) {
        std::size_t const equals = each.find('=');
        if (equals == std::string::npos) {
            error = "--var " + each + ": " + localText("expected NAME=VALUE");
            return false;
        }
        tzhost::WriteResult const written = variables.overrideFromText(
            tzhost::fromUtf8(each.substr(0, equals)), tzhost::fromUtf8(each.substr(equals + 1)));
        if (written.isDone()) continue;
        error = "--var " + each + ": " + tzhost::toUtf8(written.reason);
        return false;
    }
    return true;
}

// A language that was asked for has the module's texts; one of the environment may be unknown.
bool isLanguageThere(Options const& options, std::string& error) {
    if (!options.resources.empty()) return true;
    auto const problem = tzapps::problemWithLanguage(
        options.locale, modulePath(options).parent_path(), TzString(kResourceName).toUtf8());
    error = problem.value_or("");
    return !problem;
}

bool findTexts(Options const& options, std::string& error) {
    std::string const locale =
        options.locale.empty() ? tzhost::localeOfEnvironment() : options.locale;
    tzapps::useLanguage(locale);
    if (!isLanguageThere(options, error)) return false;
    tzhost::ResourceSearch search;
    search.folder = modulePath(options).parent_path().string();
    search.locale = locale;
    search.file = options.resources.string();
    tzhost::setResourceSearch(search);
    if (options.resources.empty() || hasModuleResources()) return true;
    bool const isRead = tzhost::readFile(search.file).has_value();
    error =
        search.file + ": " +
        (isRead ? localText("the resource library is damaged")
                : localText("the resource library cannot be read") + ": " + tzhost::systemReason());
    return false;
}

// The module makes do without a font map, so that a wrong name would go unnoticed.
bool findFontMap(Options const& options, std::string& error) {
    tzhost::setFontMapFile(options.fontMap.string());
    if (options.fontMap.empty() || tzhost::readFile(options.fontMap.string())) return true;
    error = options.fontMap.string() + ": " + localText("the font map file cannot be read") + ": " +
            tzhost::systemReason();
    return false;
}

void chooseEditors(Options const& options) {
    tzhost::Settings const& settings = tzhost::settings();
    tzhost::EditorConfiguration& editors = tzhost::editorConfiguration();
    editors.textEditor = firstOf({options.textEditor, tzhost::toUtf8(settings.textEditor),
                                  environment("VISUAL"), environment("EDITOR")});
    editors.richTextEditor = firstOf({options.richTextEditor, tzhost::toUtf8(settings.rtfEditor)});
    editors.inPlaceEditors.assign(settings.inPlaceEditors.begin(), settings.inPlaceEditors.end());
}

}  // namespace

std::filesystem::path modulePath(Options const& options) {
    std::error_code gone;  // of a working folder: the loader then says that nothing is there
    if (!options.module.empty()) return std::filesystem::absolute(options.module, gone);
    return std::filesystem::path(tzhost::libraryFolder()) / kModuleName;
}

std::string settingsFile(Options const& options) {
    return options.settings.empty() ? tzhost::defaultSettingsFile() : options.settings.string();
}

bool hasModuleResources() {
    return tzhost::openResourceFile(kResourceName).has_value();
}

bool configureHost(Options const& options, SettingsState& settings, std::string& error) {
    tzhost::Variables::instance().reset();
    if (!findTexts(options, error)) return false;
    if (!loadSettings(options, settings, error) || !setVariables(options, error)) return false;
    if (!findFontMap(options, error)) return false;
    chooseEditors(options);
    return true;
}

}  // namespace tzdraft
