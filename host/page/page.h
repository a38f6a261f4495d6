#pragma once

#include <optional>

// The page that a drawing is plotted on, as a drafter names it. Lengths on paper are millimetres.
namespace tzhost {

enum class PaperName { a0, a1, a2, a3, a4, letter, legal, tabloid, custom };

// A kind of paper. One with a name is held upright; a custom one as it stands.
struct Paper {
    PaperName name = PaperName::a4;
    double width = 210.0;
    double height = 297.0;

    friend bool operator==(Paper const&, Paper const&) = default;
};

// So many units on paper stand for so many of the drawing: 1 and 50 for 1:50.
struct PageScale {
    double paper = 1.0;
    double drawing = 1.0;

    friend bool operator==(PageScale const&, PageScale const&) = default;
};

// What a drawing unit is.
enum class PageUnit { millimetre, centimetre, metre, inch, foot };

// A rectangle, in drawing units or in millimetres; `left` is below `right`, `bottom` below `top`.
struct PageBox {
    double left = 0.0;
    double bottom = 0.0;
    double right = 0.0;
    double top = 0.0;

    [[nodiscard]] double width() const { return right - left; }
    [[nodiscard]] double height() const { return top - bottom; }
    friend bool operator==(PageBox const&, PageBox const&) = default;
};

struct Page {
    Paper paper;
    bool landscape = true;           // how a paper with a name lies
    double margin = 10.0;            // on each side
    std::optional<PageScale> scale;  // nothing: as large as fits
    PageUnit unit = PageUnit::millimetre;
    std::optional<PageBox> window;  // of the world; nothing: all that is drawn

    friend bool operator==(Page const&, Page const&) = default;
};

// What stands above the page of a drawing, member by member.
struct PageChoice {
    std::optional<Paper> paper;
    std::optional<bool> landscape;
    std::optional<double> margin;
    std::optional<std::optional<PageScale>> scale;
    std::optional<PageUnit> unit;
    std::optional<PageBox> window;
    std::optional<double> dotsPerInch;  // of a picture made of pixels

    [[nodiscard]] bool isEmpty() const;
};

// The page that a choice makes of a drawing's own; nothing when neither names any. A custom paper
// that is told how to lie lies so.
[[nodiscard]] std::optional<Page> pageOf(std::optional<Page> const& own, PageChoice const& choice);

// The same custom paper lying or upright; one with a name stays.
[[nodiscard]] Paper turned(Paper const& paper, bool landscape);

}  // namespace tzhost
