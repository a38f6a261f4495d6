#pragma once

#include <CLI/CLI.hpp>
#include <string>

// Help in the language of the user. The texts stand in English where options are declared; a
// language has a table of them beside the module, in the form of host/text/local_text.h:
//
//   lib/de/options.texts
namespace tzapps {

// Makes what --help prints of the program and its commands that of the locale, such as "de_AT":
// purpose, options, headings and the words that stand for values. What the table lacks stays
// English. Called once, after all is declared.
void speakHelp(CLI::App& app, std::string const& locale);

}  // namespace tzapps
