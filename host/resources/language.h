#pragma once

// Languages beside English: each has a folder, named for a locale such as "de_AT" or for a language
// such as "de", beside the files that it translates.
//
//   lib/tzmted.help      English
//   lib/de/tzmted.help   the same in German

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

namespace tzhost {

// The user's: of LC_ALL, LC_MESSAGES and LANG the first that says something, else empty.
[[nodiscard]] std::string localeOfEnvironment();

// Whether the locale is an English one, empty, or one of the names that stand for no language, "C"
// and "POSIX".
[[nodiscard]] bool isEnglish(std::string const& locale);

// The file of that name for the locale, else for its language, in their folders under `folder`;
// nothing when neither has one, and for English. Code page and modifier of the locale do not count:
// "de_AT.UTF-8@euro" is looked for under "de_AT", then under "de".
[[nodiscard]] std::optional<std::filesystem::path> translatedFile(
    std::filesystem::path const& folder, std::string const& locale, std::string const& name);

// The names of the folders under `folder` that hold a file of that name, sorted.
[[nodiscard]] std::vector<std::string> languagesWith(std::filesystem::path const& folder,
                                                     std::string const& name);

}  // namespace tzhost
