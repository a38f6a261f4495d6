#include "tests/layout/layout_printer.h"

#include <array>
#include <cmath>
#include <cstdio>

#include "host/text/utf8.h"

namespace tztest {
namespace {

using namespace tzhost;

// Six significant digits, with what rounding left of zero taken as zero.
std::string number(double value) {
    std::array<char, 32> text{};
    std::snprintf(text.data(), text.size(), "%.6g", std::abs(value) < 1e-9 ? 0.0 : value);
    return text.data();
}

std::string point(double x, double y) {
    return number(x / kLetter) + "," + number(y / kCapital);
}

void addWord(std::string& words, std::string const& word) {
    words += (words.empty() ? "" : " ") + word;
}

}  // namespace

MTextLayoutInput monospaced(std::wstring const& contents, double letters) {
    MTextLayoutInput input;
    input.contents = contents;
    input.width = letters * kLetter;
    input.textHeight = kCapital;
    input.style.typeface = L"DejaVu Sans Mono";
    return input;
}

std::string printLines(MTextLayout const& layout) {
    std::string words;
    for (LayoutLine const& line : layout.lines) {
        addWord(words, std::to_string(line.column) + ":" + point(line.x, line.baseline) + "," +
                           number(line.advance / kLetter));
    }
    return words;
}

std::string printGlyphRuns(MTextLayout const& layout) {
    std::string words;
    for (GlyphRun const& run : layout.runs) {
        std::string word = "'" + toUtf8(run.text) + "'@" + point(run.x, run.y) + "," +
                           number(run.advance / kLetter);
        if (run.height != kCapital) word += "*" + number(run.height / kCapital);
        addWord(words, word);
    }
    return words;
}

std::string printRules(MTextLayout const& layout) {
    std::string words;
    for (TextRule const& rule : layout.rules) {
        constexpr std::array<char const*, 4> kNames{"u", "o", "b", "s"};
        addWord(words, kNames[static_cast<std::size_t>(rule.kind)] +
                           point(rule.from.x, rule.from.y) + "-" + point(rule.to.x, rule.to.y));
    }
    return words;
}

std::string printBox(LayoutBox const& box) {
    return point(box.left, box.bottom) + "-" + point(box.right, box.top);
}

}  // namespace tztest
