#include "host/page/page_text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>

#include "host/text/local_text.h"

namespace tzhost {
namespace {

constexpr double kLeastSide = 1.0;
constexpr double kMostSide = 5000.0;

struct PaperRow {
    char const* name;
    Paper paper;
};
// Name, and the paper upright. The sizes of A papers are those of ISO 216.
constexpr PaperRow kPaperRows[] = {
    {"A0", {PaperName::a0, 841.0, 1189.0}},      {"A1", {PaperName::a1, 594.0, 841.0}},
    {"A2", {PaperName::a2, 420.0, 594.0}},       {"A3", {PaperName::a3, 297.0, 420.0}},
    {"A4", {PaperName::a4, 210.0, 297.0}},       {"letter", {PaperName::letter, 215.9, 279.4}},
    {"legal", {PaperName::legal, 215.9, 355.6}}, {"tabloid", {PaperName::tabloid, 279.4, 431.8}},
};

struct UnitRow {
    char const* name;
    double millimetres;
};
// In the order of PageUnit.
constexpr UnitRow kUnitRows[] = {
    {"mm", 1.0}, {"cm", 10.0}, {"m", 1000.0}, {"in", 25.4}, {"ft", 304.8},
};

char lower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
}

bool isSame(std::string_view a, std::string_view b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [](char x, char y) { return lower(x) == lower(y); });
}

// Two numbers with `mark` between them.
std::optional<std::pair<double, double>> readPair(std::string_view text, std::string_view marks) {
    std::size_t const at = text.find_first_of(marks);
    if (at == std::string_view::npos) return std::nullopt;
    auto const first = readPlainNumber(text.substr(0, at));
    auto const second = readPlainNumber(text.substr(at + 1));
    if (!first || !second) return std::nullopt;
    return std::pair(*first, *second);
}

}  // namespace

char const* const kPapers =
    forLocalText("A0 to A4, letter, legal, tabloid, or WxH with sides of 1 to 5000 millimetres");
char const* const kScales = forLocalText("fit, or N:M with numbers above 0");
char const* const kUnits = forLocalText("mm, cm, m, in or ft");
char const* const kWindows = forLocalText("X1,Y1,X2,Y2, two opposite corners");

std::optional<double> readPlainNumber(std::string_view text) {
    double value = 0.0;
    auto const [end, problem] = std::from_chars(text.data(), text.data() + text.size(), value);
    bool const isWhole = problem == std::errc() && end == text.data() + text.size();
    return isWhole && std::isfinite(value) ? std::optional(value) : std::nullopt;
}

std::string plainText(double value) {
    std::array<char, 32> text{};
    auto const [end, problem] = std::to_chars(text.data(), text.data() + text.size(), value);
    return {text.data(), end};
}

std::optional<Paper> readPaper(std::string_view text) {
    for (PaperRow const& row : kPaperRows) {
        if (isSame(text, row.name)) return row.paper;
    }
    auto const sides = readPair(text, "xX");
    if (!sides || std::min(sides->first, sides->second) < kLeastSide ||
        std::max(sides->first, sides->second) > kMostSide)
        return std::nullopt;
    return Paper{PaperName::custom, sides->first, sides->second};
}

std::vector<std::string> paperNames() {
    std::vector<std::string> names;
    for (PaperRow const& row : kPaperRows)
        names.emplace_back(row.name);
    return names;
}

std::string nameOf(Paper const& paper) {
    for (PaperRow const& row : kPaperRows) {
        if (row.paper.name == paper.name) return row.name;
    }
    return plainText(paper.width) + "x" + plainText(paper.height);
}

std::optional<PageScale> makeScale(double paper, double drawing) {
    bool const isPositive = paper > 0.0 && drawing > 0.0;
    if (!isPositive || !std::isnormal(paper / drawing)) return std::nullopt;
    return PageScale{paper, drawing};
}

std::optional<PageScale> readScale(std::string_view text) {
    auto const parts = readPair(text, ":");
    return parts ? makeScale(parts->first, parts->second) : std::nullopt;
}

std::optional<std::optional<PageScale>> readScaleOrFit(std::string_view text) {
    std::optional<PageScale> const scale = readScale(text);
    if (!scale && !isSame(text, "fit")) return std::nullopt;
    return std::optional<std::optional<PageScale>>(std::in_place, scale);
}

std::string nameOf(PageScale const& scale) {
    return plainText(scale.paper) + ":" + plainText(scale.drawing);
}

std::optional<PageUnit> readUnit(std::string_view text) {
    for (std::size_t i = 0; i < std::size(kUnitRows); ++i) {
        if (isSame(text, kUnitRows[i].name)) return static_cast<PageUnit>(i);
    }
    return std::nullopt;
}

char const* nameOf(PageUnit unit) {
    return kUnitRows[static_cast<std::size_t>(unit)].name;
}

double millimetresOf(PageUnit unit) {
    return kUnitRows[static_cast<std::size_t>(unit)].millimetres;
}

std::optional<PageBox> makeWindow(double x1, double y1, double x2, double y2) {
    PageBox const box{std::min(x1, x2), std::min(y1, y2), std::max(x1, x2), std::max(y1, y2)};
    bool const hasSize = std::isnormal(box.width()) && std::isnormal(box.height());
    return hasSize ? std::optional(box) : std::nullopt;
}

std::optional<PageBox> readWindow(std::string_view text) {
    std::array<double, 4> values{};
    for (std::size_t i = 0; i < values.size(); ++i) {
        std::size_t const comma = i + 1 < values.size() ? text.find(',') : text.size();
        if (comma == std::string_view::npos) return std::nullopt;
        auto const value = readPlainNumber(text.substr(0, comma));
        if (!value) return std::nullopt;
        values[i] = *value;
        text.remove_prefix(std::min(comma + 1, text.size()));
    }
    return makeWindow(values[0], values[1], values[2], values[3]);
}

std::string nameOf(PageBox const& window) {
    return plainText(window.left) + "," + plainText(window.bottom) + "," + plainText(window.right) +
           "," + plainText(window.top);
}

std::optional<std::optional<PageBox>> readWindowOrAll(std::string_view text) {
    std::optional<PageBox> const window = readWindow(text);
    if (!window && !isSame(text, "all")) return std::nullopt;
    return std::optional<std::optional<PageBox>>(std::in_place, window);
}

}  // namespace tzhost
