#include "apps/tzdraft/draft_options.h"

#include <CLI/CLI.hpp>
#include <cerrno>
#include <cstdio>
#include <sstream>

#include "apps/options/language.h"
#include "apps/options/local_help.h"
#include "apps/options/option_list.h"
#include "apps/options/usage.h"
#include "apps/tzdraft/file_options.h"
#include "apps/tzdraft/page_options.h"
#include "apps/tzdraft/program_texts.h"
#include "apps/tzdraft/version.h"
#include "host/files/standard_streams.h"
#include "host/page/page_text.h"
#include "host/text/system_words.h"
#include "host/text/visible_text.h"

namespace tzdraft {
namespace {

constexpr char kPurpose[] =
    "A drafting host with a command line: opens a drawing, runs commands, saves and plots it.";
constexpr char kScripts[] =
    "A script is UTF-8 text with one answer a line: an empty line is Enter, ^C cancels, ;; begins a\n"
    "comment, ~x,y moves the cursor in a drag, <<< and >>> enclose what an editor leaves.\n"
    "Exit status: 0 done; 1 input ended inside a command, an editor block was not taken, a SAVE, PLOT,\n"
    "OPEN or LOAD of a script failed, --strict ended the script, or the session had to end early; 2 wrong\n"
    "usage, an unusable file, or a result that cannot be written; 3 a command left something open.";

// Some files are left out by an empty name; nobody means that by writing the option.
std::string problemWithName(std::string const& name) {
    return name.empty() ? localText("the file name is empty") : "";
}

void declareText(CLI::App& app,
                 char const* name,
                 std::string& value,
                 char const* metavariable,
                 char const* help) {
    app.add_option(name, value, help)->type_name(metavariable);
}

void declareFile(CLI::App& app, char const* name, std::filesystem::path& file, char const* help) {
    app.add_option(name, file, help)->type_name("FILE")->check(problemWithName, "");
}

void declare(CLI::App& app, Options& options) {
    app.add_option("DRAWING", options.drawing, "the drawing to open; a new one when left out")
        ->type_name("")
        ->check(problemWithName, "");
    app.add_option("--script", options.script,
                   "answers from FILE ('-' is standard input); without it, an interactive session")
        ->type_name("FILE")
        ->check(problemWithName, "");
    app.add_flag("--strict", options.isStrict,
                 "end a script at the first thing that goes wrong, with status 1");
    app.add_flag("--quiet", options.isQuiet, "keep the transcript of a script to errors");
    declareFile(app, "--save", options.save, "write the drawing at the end");
    declareFile(app, "--svg", options.svg,
                "plot the active space at the end, fitted to its extents or on its page; '-' is "
                "standard output, and the transcript goes to standard error then");
    declareFile(app, "--png", options.png, "the same as a PNG picture");
    declareFile(app, "--pdf", options.pdf, "the same as a PDF page");
    declarePage(app, options);
    app.add_option("--var", options.variables,
                   "set a system variable for this run (repeatable; points as x,y,z)")
        ->type_name("NAME=VALUE")
        ->allow_extra_args(false);  // one each time, so that it can be repeated
    declareFile(app, "--font-map", options.fontMap, "the font map file");
    declareText(
        app, "--locale", options.locale, "LL",
        "the language, such as de; the environment's (LC_ALL, LC_MESSAGES, LANG) without it");
    declareFile(app, "--settings", options.settings, "the settings file");
    declareFile(app, "--module", options.module,
                "the module to load; beside the program when left out");
    declareFile(app, "--resources", options.resources, "the resource library of the module");
    declareText(app, "--rtf-editor", options.richTextEditor, "CMD",
                "program for the dialog editor, such as a word processor");
    declareText(app, "--text-editor", options.textEditor, "CMD",
                "program for the in-place and raw editors");
    declareFile(app, "--events", options.events,
                "write what passes between module and host as JSON lines");
    app.add_option("--fail", options.faults,
                   "let the K-th call of a host operation fail (repeatable)")
        ->type_name("NAME[:K][=STATUS]")
        ->allow_extra_args(false);  // one each time, so that it can be repeated
}

// The exit status.
int printAnswer(std::string const& text) {
    if (tzhost::writeStandardOutput(text)) return kDone;
    std::fprintf(stderr, "tzdraft: %s: %s\n", localText("standard output").c_str(),
                 tzhost::systemWords(errno).c_str());
    return kUnusable;
}

}  // namespace

ParsedOptions parseOptions(int count, char const* const* arguments) {
    CLI::App app(kPurpose, "tzdraft");
    app.footer(kScripts);
    app.set_version_flag("--version", kVersion);
    ParsedOptions parsed;
    declare(app, parsed.options);
    std::string const locale = tzapps::localeAsked(count, arguments);
    tzapps::useLanguage(locale);
    tzapps::speakHelp(app, locale);
    tzapps::ValueWords const words{{"--locale", tzapps::languages()},
                                   {"--paper", tzhost::paperNames()}};
    if (auto const list = tzapps::optionList(app, words, count, arguments)) {
        parsed.exit = printAnswer(*list);
        return parsed;
    }
    try {
        app.parse(count, arguments);
        checkPage(parsed.options);
        checkFiles(parsed.options);
    } catch (CLI::Success const& asked) {  // --help, --version
        std::ostringstream text;
        app.exit(asked, text);
        parsed.exit = printAnswer(text.str());
    } catch (CLI::ParseError const& wrong) {
        std::string const problem = tzapps::problemWith(app, wrong) + localText("; try --help");
        std::fprintf(stderr, "tzdraft: %s\n",
                     tzhost::visible(problem, tzhost::LineFeeds::shown).c_str());
        parsed.exit = kUnusable;
    }
    return parsed;
}

}  // namespace tzdraft
