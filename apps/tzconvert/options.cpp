#include "apps/tzconvert/options.h"

#include <CLI/CLI.hpp>
#include <cmath>
#include <limits>
#include <sstream>

#include "apps/options/option_list.h"
#include "apps/tzconvert/streams.h"

namespace tzconvert {
namespace {

constexpr char kPurpose[] = "Converts MTEXT markup to RTF and RTF to MTEXT markup.";
constexpr char kFooter[] =
    "Without FILE, or with \"-\", standard input is read; input is UTF-8 and taken byte for\n"
    "byte, and any bytes where RTF is normalised.\n"
    "Exit status: 0 done; 2 wrong usage, an unusable file, or input that is not UTF-8 or holds a\n"
    "zero character, of which nothing is written.";

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
               if (!read) throw CLI::ValidationError(name, "\"" + text + "\" is not RRGGBB");
               color = *read;
           },
           help)
        ->type_name("RRGGBB");
}

CLI::Validator aName() {
    return {[](std::string& text) { return text.empty() ? "an empty name" : std::string(); }, ""};
}

// Infinite values and those that are no number fail too.
CLI::Validator aboveZero() {
    return {[](std::string& text) {
                double value = 0;
                bool const isAbove = CLI::detail::lexical_cast(text, value) && value > 0 &&
                                     value <= std::numeric_limits<double>::max();
                return isAbove ? std::string() : text + " is no number above 0";
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
                return isSayable ? std::string() : text + " is no number that markup can say";
            },
            ""};
}

// Tracking 0 means 1 in markup.
CLI::Validator notZero() {
    return {[](std::string& text) {
                double value = 1;
                bool const isZero = CLI::detail::lexical_cast(text, value) && value == 0;
                return isZero ? text + " is no tracking" : std::string();
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
    auto* const output = app.add_option("--output", options.output, "write there")
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
        throw CLI::ValidationError("FILE", "several of them need --output-dir");
    bool const isTextOnOutput = options.outputDir.empty() && options.output.empty();
    if (isTextOnOutput && options.report == "-")
        throw CLI::ValidationError("--report", "the result goes there");
}

// What is wrong, in a line.
std::string explain(CLI::App const& app, CLI::ParseError const& wrong) {
    std::vector<std::string> const rest = app.remaining();
    if (!app.get_subcommands().empty()) {
        return rest.empty() ? wrong.what()
                            : "options stand after the command, not \"" + rest.front() + "\"";
    }
    std::string text = "expected";
    for (DirectionRow const& row : kDirections)
        text += std::string(&row == kDirections ? " " : ", ") + row.name;
    return rest.empty() ? text : text + ", not \"" + rest.front() + "\"";
}

// What was asked of the program itself, and the exit status after it.
int printAnswer(std::string const& text) {
    Failure const failure = writeBytes("", text);
    if (failure) tell(*failure);
    return failure ? kUnusable : kDone;
}

}  // namespace

char const* endingOf(Direction direction) {
    for (DirectionRow const& row : kDirections)
        if (row.direction == direction) return row.ending;
    return "";
}

ParsedOptions parseOptions(int count, char const* const* arguments) {
    CLI::App app(kPurpose, "tzconvert");
    app.footer(kFooter);
    app.set_version_flag("--version", "tzconvert 1.0");
    ParsedOptions parsed;
    declare(app, parsed.options);
    if (auto const list = tzapps::optionList(app, count, arguments)) {
        parsed.exit = printAnswer(*list);
        return parsed;
    }
    try {
        app.parse(count, arguments);
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
        tell(explain(app, wrong) + "; try --help");
        parsed.exit = kUnusable;
    }
    return parsed;
}

}  // namespace tzconvert
