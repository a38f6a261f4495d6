#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "host/layout/layout_types.h"

// Reads MTEXT markup into pieces of one look each: what the layout draws, and what a test compares.
//
//   MarkupText const read = readMarkup(L"{\\LAB\\l}\\PC", {});
//   // pieces: text "AB" underlined, paragraph end, text "C", paragraph end
//
// Any text can be read; what is no code stands as text. A zero character ends the text. The work is
// linear in the text, and groups nest without limit.
namespace tzhost {

// A font as the markup names it: by face, or by file (`byFile`).
struct MarkupFont {
    std::wstring name;
    bool byFile = false;
    bool bold = false;
    bool italic = false;
    int charset = 0;
    int pitchAndFamily = 0;

    friend bool operator==(MarkupFont const&, MarkupFont const&) = default;
};

// The look of a piece. `font` 0 is the style's font, n stands for entry n - 1 of
// `MarkupText::fonts`.
struct MarkupFormat {
    std::size_t font = 0;
    double height = 0.0;
    TextColor color;
    bool underline = false;
    bool overline = false;

    friend bool operator==(MarkupFormat const&, MarkupFormat const&) = default;
};

// First-line indent against the left indent, the left indent, and ascending tab stops, measured
// from the text's left edge.
struct ParagraphFormat {
    double firstIndent = 0.0;
    double leftIndent = 0.0;
    std::vector<double> tabs;

    friend bool operator==(ParagraphFormat const&, ParagraphFormat const&) = default;
};

enum class MarkupPieceKind { text, stack, lineBreak, paragraphEnd };

// Over puts a bar between the parts, fraction a slash, tolerance nothing.
enum class StackKind { over, fraction, tolerance };

enum class StackAlignment { bottom = 0, middle = 1, top = 2 };

// A piece of the text. `start` and `length` count in `MarkupText::text`; of a stack the first
// `upper` characters are the upper part and the rest the lower one. `paragraph` counts at a
// paragraph end: the settings in force there hold for the whole paragraph.
struct MarkupPiece {
    MarkupPieceKind kind = MarkupPieceKind::text;
    std::size_t format = 0;
    std::size_t start = 0;
    std::size_t length = 0;
    std::size_t upper = 0;
    StackKind stackKind = StackKind::over;
    StackAlignment stackAlignment = StackAlignment::bottom;
    std::size_t paragraph = 0;
};

// What was read; the last piece is always a paragraph end. Tracking, width factor and the oblique
// angle (degrees) hold for the whole text, wherever their codes stand.
struct MarkupText {
    std::wstring text;
    std::vector<MarkupPiece> pieces;
    std::vector<MarkupFormat> formats;
    std::vector<MarkupFont> fonts;
    std::vector<ParagraphFormat> paragraphs;
    double tracking = 1.0;
    double widthFactor = 1.0;
    double oblique = 0.0;
};

// Reads `contents`; `initial` is the look that it starts with.
[[nodiscard]] MarkupText readMarkup(std::wstring const& contents, MarkupFormat const& initial);

}  // namespace tzhost
