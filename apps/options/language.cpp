#include "apps/options/language.h"

#include <string_view>

#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"
#include "host/resources/language.h"
#include "host/text/local_text.h"

namespace tzapps {
namespace {

constexpr std::string_view kLocale = "--locale";

}  // namespace

std::string localeAsked(int count, char const* const* arguments) {
    for (int at = 1; at < count; ++at) {
        std::string_view const word = arguments[at];
        if (word == kLocale && at + 1 < count) return arguments[at + 1];
        if (word.starts_with(kLocale) && word.substr(kLocale.size()).starts_with('='))
            return std::string(word.substr(kLocale.size() + 1));
    }
    return tzhost::localeOfEnvironment();
}

void useLanguage(std::string const& locale) {
    auto const file = tzhost::translatedFile(tzhost::libraryFolder(), locale, kLanguageFile);
    auto const bytes = file ? tzhost::readFile(file->string()) : std::nullopt;
    std::vector<std::string> faults;  // shown where the table is made
    tzhost::setLocalTexts(bytes ? tzhost::readLocalTexts(*bytes, faults)
                                : std::vector<tzhost::LocalTextRow>());
}

std::vector<std::string> languages() {
    auto names = tzhost::languagesWith(tzhost::libraryFolder(), kLanguageFile);
    names.insert(names.begin(), "en");
    return names;
}

std::optional<std::string> problemWithLanguage(std::string const& locale,
                                               std::filesystem::path const& folder,
                                               std::string const& file) {
    if (tzhost::isEnglish(locale) || tzhost::translatedFile(folder, locale, file)) return {};
    std::string problem = "--locale " + locale + ": " +
                          tzhost::localText("no texts of this language; there are") + " en";
    for (std::string const& each : tzhost::languagesWith(folder, file))
        problem += ", " + each;
    return problem;
}

}  // namespace tzapps
