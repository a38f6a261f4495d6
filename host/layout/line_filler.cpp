#include "host/layout/line_filler.h"

#include <algorithm>
#include <cmath>

namespace tzhost {
namespace {

// How far a line may reach over its width, against that width: what rounding of sums may cost.
constexpr double kSlack = 1e-9;

class Filler {
public:
    Filler(Segment& segment, ParagraphFormat const& paragraph, WholeText const& whole, double width)
        : segment_(segment), paragraph_(paragraph), whole_(whole), width_(width) {}

    std::vector<SegmentLine> fill();

private:
    void startLine(std::size_t start);
    void endLine(std::size_t end);
    [[nodiscard]] double nextTab(double x) const;
    [[nodiscard]] bool overflows(SegmentCell const& cell) const;

    Segment& segment_;
    ParagraphFormat const& paragraph_;
    WholeText const& whole_;
    double width_;
    std::vector<SegmentLine> lines_;
    std::size_t start_ = 0;
    double indent_ = 0.0;
    double x_ = 0.0;
};

std::vector<SegmentLine> Filler::fill() {
    startLine(0);
    std::size_t lastBreak = 0;  // start of the line while it has none
    for (std::size_t i = 0; i < segment_.cells.size(); ++i) {
        SegmentCell& cell = segment_.cells[i];
        if (cell.mayBreakBefore && i > start_) {
            lastBreak = i;
        }
        if (segment_.text[i] == L'\t') {
            cell.advance = nextTab(x_) - x_;
        }
        if (overflows(cell) && lastBreak > start_) {
            endLine(lastBreak);
            startLine(lastBreak);
            // The characters after the break are met again: each once, since they fit.
            i = lastBreak - 1;
            continue;
        }
        x_ += cell.advance;
    }
    endLine(segment_.cells.size());
    return std::move(lines_);
}

bool Filler::overflows(SegmentCell const& cell) const {
    return width_ > 0.0 && !cell.isBlank && x_ + cell.advance > width_ * (1.0 + kSlack);
}

void Filler::startLine(std::size_t start) {
    bool const first = segment_.opensParagraph && start == 0;
    double const wanted = paragraph_.leftIndent + (first ? paragraph_.firstIndent : 0.0);
    // A hanging first line begins at the text's edge at the least.
    indent_ = std::max(wanted, 0.0);
    start_ = start;
    x_ = indent_;
}

void Filler::endLine(std::size_t end) {
    SegmentLine line;
    line.start = start_;
    line.end = end;
    line.indent = indent_;
    bool const wrapped = end < segment_.cells.size();
    while (wrapped && line.end > line.start && segment_.cells[line.end - 1].isBlank) {
        --line.end;
    }
    for (std::size_t i = line.start; i < line.end; ++i) {
        line.advance += segment_.cells[i].advance;
    }
    lines_.push_back(std::move(line));
}

double Filler::nextTab(double x) const {
    double const beyond = x + kSlack * std::max(std::abs(x), whole_.tabDistance);
    // The left indent of a hanging paragraph is a stop for its first line.
    if (beyond < paragraph_.leftIndent &&
        (paragraph_.tabs.empty() || paragraph_.leftIndent < paragraph_.tabs.front())) {
        return paragraph_.leftIndent;
    }
    auto const stop = std::upper_bound(paragraph_.tabs.begin(), paragraph_.tabs.end(), beyond);
    if (stop != paragraph_.tabs.end()) {
        return *stop;
    }
    double const distance = whole_.tabDistance;
    return distance > 0.0 ? (std::floor(beyond / distance) + 1.0) * distance : x;
}

// Cuts the line where direction or look changes, and at stacks and tabs.
std::vector<LineFragment> cutLine(Segment const& segment, SegmentLine const& line) {
    std::vector<LineFragment> fragments;
    auto const firstItem =
        std::upper_bound(segment.itemEnds.begin(), segment.itemEnds.end(), line.start);
    auto item = static_cast<std::size_t>(firstItem - segment.itemEnds.begin());
    bool apart = true;  // the next character opens a fragment
    for (std::size_t i = line.start; i < line.end; ++i) {
        while (item < segment.itemEnds.size() && segment.itemEnds[item] <= i) {
            ++item;
        }
        int const level = item < segment.itemLevels.size() ? segment.itemLevels[item] : 0;
        SegmentCell const& cell = segment.cells[i];
        bool const single = cell.stack != 0 || segment.text[i] == L'\t';
        if (apart || single || fragments.back().level != level ||
            segment.cells[i - 1].format != cell.format) {
            fragments.push_back({i, i, level, 0.0, 0.0});
        }
        apart = single;
        fragments.back().end = i + 1;
        fragments.back().advance += cell.advance;
    }
    return fragments;
}

// Turns every stretch of at least a level around, from the highest level down to 1.
void orderAsSeen(std::vector<LineFragment>& fragments) {
    int highest = 0;
    for (LineFragment const& fragment : fragments) {
        highest = std::max(highest, fragment.level);
    }
    for (int level = highest; level > 0; --level) {
        auto const reaches = [level](LineFragment const& f) { return f.level >= level; };
        for (auto begin = fragments.begin(); begin != fragments.end();) {
            begin = std::find_if(begin, fragments.end(), reaches);
            auto const end = std::find_if_not(begin, fragments.end(), reaches);
            std::reverse(begin, end);
            begin = end;
        }
    }
}

}  // namespace

std::vector<SegmentLine> fillLines(Segment& segment,
                                   ParagraphFormat const& paragraph,
                                   WholeText const& whole,
                                   double width) {
    std::vector<SegmentLine> lines = Filler(segment, paragraph, whole, width).fill();
    for (SegmentLine& line : lines) {
        line.fragments = cutLine(segment, line);
        orderAsSeen(line.fragments);
        double x = 0.0;
        for (LineFragment& fragment : line.fragments) {
            fragment.x = x;
            x += fragment.advance;
        }
    }
    return lines;
}

}  // namespace tzhost
