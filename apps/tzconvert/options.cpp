#include "apps/tzconvert/options.h"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <cmath>
#include <limits>
#include <sstream>

#include "apps/options/language.h"
#include "apps/options/local_help.h"
#include "apps/options/option_list.h"
#include "apps/options/usage.h"
#include "apps/tzconvert/program_texts.h"
#include "apps/tzconvert/streams.h"
#include "host/text/utf8.h"

namespace tzconvert {
namespace {

constexpr char kPurpose[] = "Converts MTEXT markup to RTF and RTF to MTEXT markup.";
constexpr char kFooter[] =
    "Help on a command: tzconvert help COMMAND.\n"
    "Without FILE, or with \"-\", standard input is read; input is UTF-8 and taken byte for\n"
    "byte, and any bytes where RTF is normalised.\n"
    "Exit status: 0 done; 1 a warning under --werror; 2 wrong usage, an unusable file, or input\n"
    "that is not UTF-8 or holds a zero character, of which nothing is written.";

struct DirectionRow {
    char const* name;
    Direction direction;
    char const* ending;  // of the result's file
    char const* help;
};
constexpr DirectionRow kDirections[] = {
    {"to-rtf", Direction::toRtf, ".rtf", "markup to RTF"},
    {"to-mtext", Direction::toMtext, ".mtext", "RTF to markup"},
    {"round-trip", Direction::roundTrip, ".mtext", "markup to RTF to markup within one session"},
    {"normalise", Direction::normalise, ".rtf", "any RTF to the RTF that to-mtext reads"},
};

// What an RTF size can say: half-points of 10 twips.
constexpr int kFewestTwips = 10;
constexpr int kMostTwips = 65535;

// Numbers of this size are written in six digits without an exponent.
constexpr double kLeastInMarkup = 1e-4;
constexpr double kBeyondMarkup = 999999.5;

constexpr char kHexDigits[] = "0123456789abcdefABCDEF";

// RRGGBB as 0x00BBGGRR; nothing when it is not six hex digits.
std::optional<unsigned int> colorOf(std::string const& text) {
    if (text.size() != 6 || text.find_first_not_of(kHexDigits) != std::string::npos) return {};
    unsigned long const rgb = std::stoul(text, nullptr, 16);
    return static_cast<unsigned int>(((rgb & 0xFF) << 16) | (rgb & 0xFF00) | (rgb >> 16));
}

template <class Color>
void declareColor(CLI::App& app, char const* name, Color& color, char const* help) {
    app.add_option_function<std::string>(
           name,
           [name, &color](std::string const& text) {
               std::optional<unsigned int> const read = colorOf(text);
               if (!read)
                   throw CLI::ValidationError(name,
                                              filled(localText("\"%s\" is not RRGGBB"), {text}));
               color = *read;
           },
           help)
        ->type_name("RRGGBB");
}

CLI::Validator aName() {
    return {
        [](std::string& text) { return text.empty() ? localText("an empty name") : std::string(); },
        ""};
}

// Infinite values and those that are no number fail too.
CLI::Validator aboveZero() {
    return {[](std::string& text) {
                double value = 0;
                bool const isAbove = CLI::detail::lexical_cast(text, value) && value > 0 &&
                                     value <= std::numeric_limits<double>::max();
                return isAbove ? std::string()
                               : filled(localText("%s is no number above 0"), {text});
            },
            ""};
}

// Markup knows no exponent, and neither infinity nor what is no number.
CLI::Validator sayable() {
    return {[](std::string& text) {
                double value = 0;
                bool const isSayable = CLI::detail::lexical_cast(text, value) &&
                                       (value == 0 || (std::abs(value) >= kLeastInMarkup &&
                                                       std::abs(value) < kBeyondMarkup));
                return isSayable ? std::string()
                                 : filled(localText("%s is no number that markup can say"), {text});
            },
            ""};
}

// Tracking 0 means 1 in markup.
CLI::Validator notZero() {
    return {[](std::string& text) {
                double value = 1;
                bool const isZero = CLI::detail::lexical_cast(text, value) && value == 0;
                return isZero ? filled(localText("%s is no tracking"), {text}) : std::string();
            },
            ""};
}

void declareFont(CLI::App& app, Options& options) {
    auto* const face = app.add_option("--font", options.face, "the style's font, by face")
                           ->type_name("FACE")
                           ->check(aName());
    app.add_flag("--bold", options.bold, "the face is bold")->needs(face);
    app.add_flag("--italic", options.italic, "the face is italic")->needs(face);
    app.add_option("--charset", options.charset, "its character set (0)")
        ->type_name("N")
        ->check(CLI::Range(0, 255))
        ->needs(face);
    app.add_option("--pitch", options.pitch, "its pitch and family (0)")
        ->type_name("N")
        ->check(CLI::Range(0, 255))
        ->needs(face);
    app.add_option("--font-file", options.fontFile, "the style's font, by file (txt.shx)")
        ->type_name("FILE")
        ->check(aName())
        ->excludes(face);
}

void declareText(CLI::App& app, Options& options) {
    app.add_option("--size", options.size, "the style's size in drawing units (0.2)")
        ->type_name("UNITS")
        ->check(aboveZero());
    app.add_option("--twips", options.twips, "the same size in twips of the document (320)")
        ->type_name("N")
        ->check(CLI::Range(kFewestTwips, kMostTwips));
    declareColor(app, "--color", options.color, "the initial colour (000000)");
    declareColor(app, "--by-layer", options.byLayer, "the colour of ByLayer (not set)");
    declareColor(app, "--by-block", options.byBlock, "the colour of ByBlock (not set)");
    app.add_option("--tracking", options.tracking, "to-mtext: tracking of the whole text (1)")
        ->type_name("R")
        ->check(sayable())
        ->check(notZero());
    app.add_option("--width-factor", options.widthFactor, "to-mtext: its width factor (1)")
        ->type_name("R")
        ->check(sayable());
    app.add_option("--oblique", options.oblique, "to-mtext: its oblique angle (0)")
        ->type_name("R")
        ->check(sayable());
    app.add_option("--base-alignment", options.baseAlignment,
                   "to-mtext: its stacks stand at 0 bottom, 1 middle, 2 top (0)")
        ->type_name("N")
        ->check(CLI::Range(0, 2));
    app.add_flag("--keep-trailing-paragraphs", options.keepsTrailingParagraphs,
                 "keep paragraph marks at the end of the markup");
    app.add_option("--code-page", options.codePage, "the system's code page (1252)")
        ->type_name("N")
        ->check(CLI::Range(1, 65535));
}

void declareFiles(CLI::App& app, Options& options) {
    app.add_option("FILE", options.files, "what to convert")->type_name("")->check(aName());
    app.add_option("--font-map", options.fontMap, "a font map file in place of the shipped one")
        ->type_name("FILE")
        ->check(aName());
    app.add_flag(
        "-r,--recursive", options.isRecursive,
        "a folder stands for the files in it and below it, which keep their places in DIR");
    auto* const output = app.add_option("-o,--output", options.output, "write there")
                             ->type_name("FILE")
                             ->check(aName());
    app.add_option("--output-dir", options.outputDir, "write each FILE's result into that folder")
        ->type_name("DIR")
        ->check(aName())
        ->check(CLI::ExistingDirectory)
        ->excludes(output);
    app.add_option("--report", options.report, "write what the conversion found as JSON")
        ->type_name("FILE")
        ->check(aName());
    app.add_flag("-q,--quiet", options.isQuiet, "no warnings and no summary");
    app.add_flag("--werror", options.warningsAreErrors, "warnings end with status 1");
    app.add_option(
           "--locale", options.locale,
           "the language, such as de; the environment's (LC_ALL, LC_MESSAGES, LANG) without it")
        ->type_name("LL");
}

void declare(CLI::App& app, Options& options) {
    app.require_subcommand(1);
    for (DirectionRow const& row : kDirections) {
        CLI::App& command = *app.add_subcommand(row.name, row.help);
        Direction const direction = row.direction;
        command.callback([&options, direction] { options.direction = direction; });
        declareFont(command, options);
        declareText(command, options);
        declareFiles(command, options);
        if (direction == Direction::toMtext) {
            command.add_flag("--normalise", options.normalises,
                             "any RTF is read, bytes in the code pages that it names");
        }
        command.footer(kFooter);
    }
}

// What options say together.
void checkTogether(Options const& options) {
    if (options.files.size() > 1 && options.outputDir.empty())
        throw CLI::ValidationError("FILE", localText("several of them need --output-dir"));
    if (options.isRecursive && options.outputDir.empty())
        throw CLI::ValidationError("--recursive", localText("it needs --output-dir"));
    bool const isTextOnOutput = options.outputDir.empty() && options.output.empty();
    if (isTextOnOutput && options.report == "-")
        throw CLI::ValidationError("--report", localText("the result goes there"));
}

constexpr char kHelp[] = "help";

std::vector<std::wstring> commandNames() {
    std::vector<std::wstring> names = {tzhost::fromUtf8(kHelp), L"--help", L"--version"};
    for (DirectionRow const& row : kDirections)
        names.push_back(tzhost::fromUtf8(row.name));
    return names;
}

// What is wrong with the first word, which should be a command.
std::string explainCommand(std::vector<std::string> const& rest) {
    std::string names;
    for (DirectionRow const& row : kDirections)
        names += std::string(&row == kDirections ? "" : ", ") + row.name;
    if (rest.empty()) return filled(localText("expected %s"), {names});
    return filled(localText("expected %s, not \"%s\""), {names, rest.front()}) +
           tzapps::nearMiss(rest.front(), commandNames());
}

// What is wrong, in a line.
std::string explain(CLI::App const& app, CLI::ParseError const& wrong) {
    std::vector<std::string> const rest = app.remaining();
    if (app.get_subcommands().empty()) return explainCommand(rest);
    if (!rest.empty()) {
        return filled(localText("options stand after the command, not \"%s\""), {rest.front()});
    }
    return tzapps::problemWith(*app.get_subcommands().front(), wrong);
}

// What was asked of the program itself, and the exit status after it.
int printAnswer(std::string const& text) {
    Failure const failure = writeBytes("", text);
    if (failure) tell(*failure);
    return failure ? kUnusable : kDone;
}

bool isCommand(std::string_view name) {
    return std::any_of(std::begin(kDirections), std::end(kDirections),
                       [&](DirectionRow const& row) { return name == row.name; });
}

// The words of the command line: "help COMMAND" stands for "COMMAND --help". Nothing when help is
// wanted on what is no command, which is said.
std::optional<std::vector<char const*>> wordsOf(int count, char const* const* arguments) {
    std::vector<char const*> words(arguments, arguments + count);
    if (words.size() < 2 || std::string_view(words[1]) != kHelp) return words;
    words.erase(words.begin() + 1);
    if (words.size() > 1 && !isCommand(words[1]) && *words[1] != '-') {
        tell(explainCommand({words[1]}) + localText("; try --help"));
        return std::nullopt;
    }
    words.push_back("--help");
    return words;
}

}  // namespace

bool readsRtf(Direction direction) {
    return direction == Direction::toMtext || direction == Direction::normalise;
}

char const* endingOf(Direction direction) {
    for (DirectionRow const& row : kDirections)
        if (row.direction == direction) return row.ending;
    return "";
}

ParsedOptions parseOptions(int count, char const* const* arguments) {
    CLI::App app(kPurpose, "tzconvert");
    app.footer(kFooter);
    app.set_version_flag("-v,--version", "tzconvert 1.0");
    ParsedOptions parsed;
    declare(app, parsed.options);
    std::string const locale = tzapps::localeAsked(count, arguments);
    tzapps::useLanguage(locale);
    tzapps::speakHelp(app, locale);
    if (auto const list =
            tzapps::optionList(app, {{"--locale", tzapps::languages()}}, count, arguments)) {
        parsed.exit = printAnswer(*list);
        return parsed;
    }
    auto const words = wordsOf(count, arguments);
    if (!words) {
        parsed.exit = kUnusable;
        return parsed;
    }
    try {
        app.parse(static_cast<int>(words->size()), words->data());
        if (parsed.options.output == "-") parsed.options.output.clear();
        if (parsed.options.files.empty()) parsed.options.files.push_back("-");
        checkTogether(parsed.options);
    } catch (CLI::CallForVersion const& version) {
        parsed.exit = printAnswer(std::string(version.what()) + '\n');
    } catch (CLI::Success const&) {  // --help; CLI11 finds the command asked about
        std::ostringstream text;
        app.exit(CLI::CallForHelp(), text);
        parsed.exit = printAnswer(text.str());
    } catch (CLI::ParseError const& wrong) {
        tell(explain(app, wrong) + localText("; try --help"));
        parsed.exit = kUnusable;
    }
    return parsed;
}

}  // namespace tzconvert
