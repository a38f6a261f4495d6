#include "apps/options/local_help.h"

#include <map>
#include <memory>

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

// Names of files to give, like those of values, are looked up.
class Formatter : public CLI::Formatter {
public:
    explicit Formatter(CLI::Formatter const& other) : CLI::Formatter(other) {}

    std::string make_option_name(CLI::Option const* option, bool isPositional) const override {
        std::string const name = CLI::Formatter::make_option_name(option, isPositional);
        return isPositional ? get_label(name) : name;
    }
};

void translate(CLI::App& app,
               Words const& words,
               std::shared_ptr<CLI::FormatterBase> const& formatter) {
    app.formatter(formatter);
    app.description(inWords(words, app.get_description()));
    app.footer(inWords(words, app.get_footer()));
    for (CLI::Option* const each : app.get_options()) {
        each->description(inWords(words, each->get_description()));
        if (!each->get_group().empty()) each->group(inWords(words, each->get_group()));
    }
    for (CLI::App* const each : app.get_subcommands({})) {
        translate(*each, words, formatter);
        each->group(inWords(words, each->get_group()));
    }
}

}  // namespace

void speakHelp(CLI::App& app, std::string const& locale) {
    Words const words = wordsOf(locale);
    if (words.empty()) return;
    auto const formatter =
        std::make_shared<Formatter>(dynamic_cast<CLI::Formatter const&>(*app.get_formatter()));
    for (auto const& [english, local] : words)
        formatter->label(english, local);
    translate(app, words, formatter);
}

}  // namespace tzapps
