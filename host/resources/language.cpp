#include "host/resources/language.h"

#include <algorithm>
#include <cstdlib>

namespace tzhost {

namespace fs = std::filesystem;

namespace {

// Without code page and modifier: "de_AT" of "de_AT.UTF-8@euro".
std::string nameOf(std::string const& locale) {
    return locale.substr(0, locale.find_first_of(".@"));
}

// The language of a name without them.
std::string languageOf(std::string const& name) {
    return name.substr(0, name.find_first_of("_-"));
}

}  // namespace

std::string localeOfEnvironment() {
    for (char const* const name : {"LC_ALL", "LC_MESSAGES", "LANG"}) {
        char const* const value = std::getenv(name);
        if (value && *value != '\0') return value;
    }
    return {};
}

bool isEnglish(std::string const& locale) {
    std::string const language = languageOf(nameOf(locale));
    return locale.empty() || language == "C" || language == "POSIX" || language == "en";
}

std::optional<fs::path>
translatedFile(fs::path const& folder, std::string const& locale, std::string const& name) {
    // A slash would lead out of the folder, so such a text is no locale.
    if (isEnglish(locale) || locale.find('/') != locale.npos) return std::nullopt;
    std::string const whole = nameOf(locale);
    for (std::string const& part : {whole, languageOf(whole)}) {
        if (part.empty()) continue;
        fs::path file = folder / part / name;
        std::error_code unreadable;  // as good as none
        if (fs::exists(file, unreadable)) return file;
    }
    return std::nullopt;
}

std::vector<std::string> languagesWith(fs::path const& folder, std::string const& name) {
    std::vector<std::string> names;
    std::error_code unreadable;  // such a folder has no languages
    for (fs::directory_iterator each(folder, unreadable), end; each != end;
         each.increment(unreadable)) {
        std::error_code gone;
        if (fs::exists(each->path() / name, gone)) names.push_back(each->path().filename());
    }
    std::sort(names.begin(), names.end());
    return names;
}

}  // namespace tzhost
