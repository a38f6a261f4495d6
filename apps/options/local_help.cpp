#include "apps/options/local_help.h"

#include <map>

#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"
#include "host/resources/language.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzapps {
namespace {

constexpr char kTable[] = "options.texts";

using Words = std::map<std::string, std::string>;  // English, local

Words wordsOf(std::string const& locale) {
    auto const file = tzhost::translatedFile(tzhost::libraryFolder(), locale, kTable);
    auto const bytes = file ? tzhost::readFile(file->string()) : std::nullopt;
    Words words;
    if (!bytes) return words;
    std::vector<std::string> faults;  // shown where the table is made
    for (tzhost::LocalTextRow const& row : tzhost::readLocalTexts(*bytes, faults))
        words.emplace(tzhost::toUtf8(row.english), tzhost::toUtf8(row.local));
    return words;
}

std::string inWords(Words const& words, std::string const& english) {
    auto const at = words.find(english);
    return at == words.end() ? english : at->second;
}

void translate(CLI::App& app, Words const& words) {
    app.description(inWords(words, app.get_description()));
    app.footer(inWords(words, app.get_footer()));
    for (CLI::Option* const each : app.get_options()) {
        each->description(inWords(words, each->get_description()));
        if (!each->get_group().empty()) each->group(inWords(words, each->get_group()));
    }
    for (CLI::App* const each : app.get_subcommands({})) {
        translate(*each, words);
        each->group(inWords(words, each->get_group()));
    }
}

}  // namespace

void speakHelp(CLI::App& app, std::string const& locale) {
    Words const words = wordsOf(locale);
    if (words.empty()) return;
    // The commands share the formatter, which looks headings and names of values up.
    for (auto const& [english, local] : words)
        app.get_formatter()->label(english, local);
    translate(app, words);
}

}  // namespace tzapps
