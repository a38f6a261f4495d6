#include "tests/layout/markup_runs.h"

#include <array>
#include <cstdio>
#include <fstream>
#include <string_view>
#include <utility>

#include "host/text/utf8.h"

namespace tztest {
namespace {

using namespace tzhost;

constexpr std::array<std::pair<std::wstring_view, wchar_t>, 3> kNames{{
    {L"<LF>", L'\n'},
    {L"<TAB>", L'\t'},
    {L"<NBSP>", L'\u00A0'},
}};

std::wstring withCharacters(std::wstring text) {
    for (auto const& [name, character] : kNames) {
        for (std::size_t at = 0; (at = text.find(name, at)) != std::wstring::npos; ++at) {
            text.replace(at, name.size(), 1, character);
        }
    }
    return text;
}

std::string withNames(std::wstring const& text) {
    std::wstring named;
    for (wchar_t const c : text) {
        std::wstring part(1, c);
        for (auto const& [name, character] : kNames) {
            if (c == character) part = name;
        }
        named += part;
    }
    return toUtf8(named);
}

std::string number(double value) {
    std::array<char, 32> text{};
    std::snprintf(text.data(), text.size(), "%g", value);
    return text.data();
}

void addWord(std::string& words, std::string const& word) {
    words += (words.empty() ? "" : " ") + word;
}

std::string colorWord(TextColor const& color) {
    if (color.kind == TextColorKind::index) return "C" + std::to_string(color.index);
    std::array<char, 16> text{};
    std::snprintf(text.data(), text.size(), "c%06X", color.rgb);
    return text.data();
}

std::string fontWord(MarkupFont const& font) {
    std::string word = (font.byFile ? "F:" : "f:") + toUtf8(font.name);
    word += font.bold ? "|b" : "";
    word += font.italic ? "|i" : "";
    word += "|c" + std::to_string(font.charset);
    word += font.pitchAndFamily != 0 ? "|p" + std::to_string(font.pitchAndFamily) : "";
    return word;
}

std::string look(MarkupText const& read, MarkupFormat const& format, MarkupFormat const& initial) {
    std::string words;
    if (format.font != initial.font) addWord(words, fontWord(read.fonts[format.font - 1]));
    if (format.height != initial.height) addWord(words, "H" + number(format.height));
    if (!(format.color == initial.color)) addWord(words, colorWord(format.color));
    if (format.underline) addWord(words, "L");
    if (format.overline) addWord(words, "O");
    return words.empty() ? "" : "(" + words + ")";
}

std::string paragraphWord(ParagraphFormat const& paragraph) {
    std::string words;
    if (paragraph.firstIndent != 0.0) addWord(words, "i" + number(paragraph.firstIndent));
    if (paragraph.leftIndent != 0.0) addWord(words, "l" + number(paragraph.leftIndent));
    for (std::size_t i = 0; i < paragraph.tabs.size(); ++i) {
        addWord(words, "t" + number(paragraph.tabs[i]));
    }
    return words.empty() ? "P" : "P(" + words + ")";
}

std::string pieceWord(MarkupText const& read, MarkupPiece const& piece) {
    std::wstring const text = read.text.substr(piece.start, piece.length);
    switch (piece.kind) {
    case MarkupPieceKind::text: return "'" + withNames(text) + "'";
    case MarkupPieceKind::stack: {
        constexpr std::string_view kSigns = "/#^";
        std::string word = "<" + withNames(text.substr(0, piece.upper));
        word += kSigns[static_cast<std::size_t>(piece.stackKind)];
        word += withNames(text.substr(piece.upper)) + ">";
        int const alignment = static_cast<int>(piece.stackAlignment);
        return alignment == 0 ? word : word + "@" + std::to_string(alignment);
    }
    case MarkupPieceKind::lineBreak: return "N";
    case MarkupPieceKind::paragraphEnd: return paragraphWord(read.paragraphs[piece.paragraph]);
    }
    return {};
}

}  // namespace

std::vector<RunsCase> readRunsFile(std::string const& path) {
    std::vector<RunsCase> cases;
    std::ifstream file(path);
    int number = 0;
    for (std::string line; std::getline(file, line);) {
        ++number;
        std::size_t const name = line.find(": ");
        std::size_t const arrow = line.rfind(" => ");
        if (line.empty() || line[0] == '#' || name >= arrow || arrow == std::string::npos) {
            continue;
        }
        std::string const markup = line.substr(name + 2, arrow - name - 2);
        cases.push_back({number, line.substr(0, name), withCharacters(fromUtf8(markup)),
                         line.substr(arrow + 4)});
    }
    return cases;
}

std::string printRuns(MarkupText const& read, MarkupFormat const& initial) {
    std::string words;
    for (MarkupPiece const& piece : read.pieces) {
        bool const drawn =
            piece.kind == MarkupPieceKind::text || piece.kind == MarkupPieceKind::stack;
        std::string const marks = drawn ? look(read, read.formats[piece.format], initial) : "";
        addWord(words, marks + pieceWord(read, piece));
    }
    if (read.tracking != 1.0) addWord(words, "T" + number(read.tracking));
    if (read.widthFactor != 1.0) addWord(words, "W" + number(read.widthFactor));
    if (read.oblique != 0.0) addWord(words, "Q" + number(read.oblique));
    return words;
}

}  // namespace tztest
