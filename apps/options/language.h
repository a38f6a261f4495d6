#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

// The language that a program speaks.
namespace tzapps {

// The locale that the arguments name by --locale LL or --locale=LL; without it the environment's.
[[nodiscard]] std::string localeAsked(int count, char const* const* arguments);

// Makes the texts of the host and its programs (host/text/local_text.h) those of the locale, from
//
//   lib/de/tzdraft.texts
//
// What such a table lacks is shown in English.
void useLanguage(std::string const& locale);

// What is wrong with a locale that was asked for: it is not English, and no folder of its language
// under `folder` holds the file. The languages that have one are named.
[[nodiscard]] std::optional<std::string> problemWithLanguage(std::string const& locale,
                                                             std::filesystem::path const& folder,
                                                             std::string const& file);

// The languages that useLanguage knows.
[[nodiscard]] std::vector<std::string> languages();

// The table of useLanguage, which all languages have.
inline constexpr char kLanguageFile[] = "tzdraft.texts";

}  // namespace tzapps
