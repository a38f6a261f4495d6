#include "host/base/language.h"

#include <algorithm>

namespace tzhost {

namespace fs = std::filesystem;

std::string localeName(std::string const& locale) {
    std::string name = locale.substr(0, locale.find_first_of(".@"));
    std::string const language = name.substr(0, name.find_first_of("_-"));
    return language == "C" || language == "POSIX" || language == "en" ? std::string() : name;
}

std::optional<fs::path>
translatedFile(fs::path const& folder, std::string const& locale, std::string const& name) {
    // A locale is a plain word: one that would lead elsewhere is none.
    if (locale.find('/') != locale.npos) return std::nullopt;
    std::string const whole = localeName(locale);
    std::string const language = whole.substr(0, whole.find_first_of("_-"));
    for (std::string const& part : {whole, language}) {
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
