#pragma once

#include <optional>
#include <string>
#include <vector>

// What the program was told on its command line.
namespace tzconvert {

// Exit statuses.
inline constexpr int kDone = 0;
inline constexpr int kWarned = 1;    // a warning under --werror
inline constexpr int kUnusable = 2;  // wrong usage, an unusable file, or input that was refused

enum class Direction { toRtf, toMtext, roundTrip, normalise };

// The ending of the name of a result, with its dot.
[[nodiscard]] char const* endingOf(Direction direction);
// Whether a conversion reads RTF; the others read markup.
[[nodiscard]] bool readsRtf(Direction direction);

struct Options {
    Direction direction = Direction::toRtf;
    std::vector<std::string> files;  // at least one; "-" is standard input
    bool isRecursive = false;        // a folder stands for the files in it and below it
    bool isQuiet = false;            // errors alone are told
    bool warningsAreErrors = false;

    // The text style's font: a face, or a file when there is none.
    std::string face;
    bool bold = false;
    bool italic = false;
    int charset = 0;
    int pitch = 0;
    std::string fontFile = "txt.shx";

    // The text style's size, in drawing units and in twips.
    double size = 0.2;
    int twips = 320;
    // Colours as 0x00BBGGRR.
    unsigned int color = 0;
    std::optional<unsigned int> byLayer;
    std::optional<unsigned int> byBlock;

    // Whole-text values of markup that is written.
    double tracking = 1.0;
    double widthFactor = 1.0;
    double oblique = 0.0;
    int baseAlignment = 0;
    bool keepsTrailingParagraphs = false;
    bool normalises = false;  // RTF that is read goes through the normaliser

    int codePage = 1252;    // the system's
    std::string fontMap;    // empty: the shipped one
    std::string output;     // empty: standard output
    std::string outputDir;  // empty: none
    std::string report;     // empty: none
    std::string locale;     // empty: the environment's
};

struct ParsedOptions {
    Options options;
    std::optional<int> exit;  // the program ends at once with this status
};

// Prints help to standard output and what is wrong to standard error.
[[nodiscard]] ParsedOptions parseOptions(int count, char const* const* arguments);

}  // namespace tzconvert
