#include "apps/tzdraft/page_options.h"

#include <algorithm>
#include <string>
#include <utility>

#include "apps/tzdraft/program_texts.h"
#include "host/page/page_plan.h"
#include "host/page/page_text.h"
#include "host/text/filled.h"

namespace tzdraft {
namespace {

[[noreturn]] void refuse(char const* option, std::string const& text, std::string const& expected) {
    throw CLI::ValidationError(
        option, tzhost::filled(localText("\"%s\" is none, expected %s"), {text, expected}));
}

// An option with a text that `read` makes a value of.
template <class Value, class Read>
void declareRead(CLI::App& app,
                 char const* name,
                 char const* metavariable,
                 char const* help,
                 Value& value,
                 Read read,
                 char const* expected) {
    app.add_option_function<std::string>(
           name,
           [=, &value](std::string const& text) {
               auto const found = read(text);
               if (!found) refuse(name, text, localText(expected));
               value = *found;
           },
           help)
        ->type_name(metavariable);
}

std::optional<double> readMargin(std::string const& text) {
    auto const value = tzhost::readPlainNumber(text);
    return value && *value >= 0.0 ? value : std::nullopt;
}

std::optional<double> readDots(std::string const& text) {
    constexpr double kLeast = 1.0;
    constexpr double kMost = 10'000.0;
    auto const value = tzhost::readPlainNumber(text);
    return value && *value >= kLeast && *value <= kMost ? value : std::nullopt;
}

std::optional<tzhost::PlotSpace> readSpace(std::string const& text) {
    constexpr std::pair<char const*, tzhost::PlotSpace> kSpaces[] = {
        {"model", tzhost::PlotSpace::model},
        {"paper", tzhost::PlotSpace::paper},
        {"all", tzhost::PlotSpace::all},
    };
    auto const* const at = std::find_if(std::begin(kSpaces), std::end(kSpaces),
                                        [&](auto const& each) { return text == each.first; });
    return at != std::end(kSpaces) ? std::optional(at->second) : std::nullopt;
}

int plotsOnOutput(Options const& options) {
    auto const files = {&options.svg, &options.png, &options.pdf};
    return static_cast<int>(
        std::count_if(files.begin(), files.end(), [](auto const* file) { return *file == "-"; }));
}

}  // namespace

bool plotsToOutput(Options const& options) {
    return plotsOnOutput(options) > 0;
}

void declarePage(CLI::App& app, Options& options) {
    tzhost::PageChoice& page = options.page;
    declareRead(app, "--paper", "PAPER",
                "plot on paper: A0 to A4, letter, legal, tabloid, or WxH in millimetres",
                page.paper, tzhost::readPaper, tzhost::kPapers);
    CLI::Option* const portrait = app.add_flag_callback(
        "--portrait", [&page] { page.landscape = false; }, "the paper stands upright");
    app.add_flag_callback(
           "--landscape", [&page] { page.landscape = true; },
           "the paper lies on its side, as papers with a name do without being told")
        ->excludes(portrait);
    declareRead(app, "--margin", "MM", "the margin on each side of the paper, 10 when left out",
                page.margin, readMargin, forLocalText("millimetres, 0 or more"));
    declareRead(app, "--scale", "N:M", "the scale, or \"fit\", as when left out", page.scale,
                tzhost::readScaleOrFit, tzhost::kScales);
    declareRead(app, "--unit", "mm|cm|m|in|ft",
                "what a drawing unit is: mm (when left out), cm, m, in, ft", page.unit,
                tzhost::readUnit, tzhost::kUnits);
    declareRead(app, "--window", "X1,Y1,X2,Y2", "plot this part of the world alone", page.window,
                tzhost::readWindow, tzhost::kWindows);
    declareRead(app, "--dpi", "N", "pixels in an inch of a PNG on paper, 300 when left out",
                page.dotsPerInch, readDots, forLocalText("a number from 1 to 10000"));
    declareRead(app, "--space", "model|paper|all",
                "plot the model, the paper, or all: a PDF page for each that holds something",
                options.space, readSpace, forLocalText("model, paper or all"));
}

void checkPage(Options const& options) {
    if (options.page.paper) {
        if (auto const problem = tzhost::problemOf(*tzhost::pageOf(std::nullopt, options.page)))
            throw CLI::ValidationError("--paper", *problem);
    }
    if (plotsOnOutput(options) > 1)
        throw CLI::ValidationError("-", localText("standard output takes one plot alone"));
    bool const hasPicture = !options.svg.empty() || !options.png.empty();
    if (options.space == tzhost::PlotSpace::all && hasPicture)
        throw CLI::ValidationError("--space", localText("only a PDF has a page for each space"));
}

}  // namespace tzdraft
