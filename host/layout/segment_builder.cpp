#include "host/layout/segment_builder.h"

#include <utility>

#include "host/layout/face_table.h"
#include "host/layout/glyph_run.h"
#include "host/layout/stack_layout.h"
#include "host/shaping/shaper.h"

namespace tzhost {
namespace {

// Stands for a stack while lines are broken: a digit, so that a stack stays with the number before
// it.
constexpr wchar_t kStackPlace = L'0';

bool isDropped(wchar_t c) {
    return (c >= 0 && c < L' ' && c != L'\t') || (c >= 0x7F && c < 0xA0);
}

class Builder {
public:
    Builder(MarkupText const& markup,
            std::vector<LineFormat> const& formats,
            WholeText const& whole)
        : markup_(markup), formats_(formats), whole_(whole) {}

    std::vector<Segment> build();

private:
    void addText(MarkupPiece const& piece);
    void addStack(MarkupPiece const& piece);
    void addCell(wchar_t c, std::size_t format, std::size_t stack);
    void endSegment(MarkupPiece const& piece);
    void shape();
    void measure(SegmentCell& cell, ShapedCharacter const& character) const;

    MarkupText const& markup_;
    std::vector<LineFormat> const& formats_;
    WholeText const& whole_;
    Segment segment_;
    std::vector<Segment> segments_;
    std::size_t paragraphStart_ = 0;  // the first segment of the paragraph being built
};

std::vector<Segment> Builder::build() {
    for (MarkupPiece const& piece : markup_.pieces) {
        switch (piece.kind) {
        case MarkupPieceKind::text: addText(piece); break;
        case MarkupPieceKind::stack: addStack(piece); break;
        case MarkupPieceKind::lineBreak:
        case MarkupPieceKind::paragraphEnd: endSegment(piece); break;
        }
    }
    return std::move(segments_);
}

void Builder::addText(MarkupPiece const& piece) {
    for (std::size_t i = piece.start; i < piece.start + piece.length; ++i) {
        if (!isDropped(markup_.text[i])) {
            addCell(markup_.text[i], piece.format, 0);
        }
    }
}

void Builder::addStack(MarkupPiece const& piece) {
    StackText stack;
    stack.upper = markup_.text.substr(piece.start, piece.upper);
    stack.lower = markup_.text.substr(piece.start + piece.upper, piece.length - piece.upper);
    stack.kind = piece.stackKind;
    stack.alignment = piece.stackAlignment;
    segment_.stacks.push_back(layStack(stack, formats_[piece.format], whole_));
    addCell(kStackPlace, piece.format, segment_.stacks.size());
}

void Builder::addCell(wchar_t c, std::size_t format, std::size_t stack) {
    segment_.text += c;
    SegmentCell cell;
    cell.format = format;
    cell.stack = stack;
    segment_.cells.push_back(cell);
}

void Builder::endSegment(MarkupPiece const& piece) {
    shape();
    segment_.endFormat = piece.format;
    segment_.opensParagraph = segments_.size() == paragraphStart_;
    segments_.push_back(std::exchange(segment_, {}));
    if (piece.kind == MarkupPieceKind::paragraphEnd) {
        for (std::size_t i = paragraphStart_; i < segments_.size(); ++i) {
            segments_[i].paragraph = piece.paragraph;
        }
        paragraphStart_ = segments_.size();
    }
}

void Builder::shape() {
    std::vector<SegmentCell>& cells = segment_.cells;
    std::vector<ShapeSpan> spans;
    for (std::size_t i = 0; i < cells.size(); ++i) {
        if (i == 0 || cells[i].format != cells[i - 1].format) {
            spans.push_back({0, formats_[cells[i].format].face});
        }
        ++spans.back().length;
    }
    ShapedText const shaped = shapeText(segment_.text, spans, ligaturesOf(whole_));
    for (std::size_t i = 0; i < cells.size(); ++i) {
        measure(cells[i], shaped.characters[i]);
    }
    for (ShapedItem const& item : shaped.items) {
        segment_.itemEnds.push_back(item.end);
        segment_.itemLevels.push_back(item.level);
    }
}

void Builder::measure(SegmentCell& cell, ShapedCharacter const& character) const {
    LineFormat const& format = formats_[cell.format];
    cell.mayBreakBefore = character.mayBreakBefore;
    cell.isBlank = character.isBlank;
    cell.opensLetter = character.opensLetter;
    LaidStack const* const stack = cell.stack != 0 ? &segment_.stacks[cell.stack - 1] : nullptr;
    cell.width =
        stack != nullptr ? stack->advance : character.advance * advanceScale(format, whole_);
    cell.advance = cell.width;
    if (whole_.flow == TextFlow::down) {
        double const beyond = stack != nullptr ? stack->top - stack->bottom - format.height : 0.0;
        double const step = kVerticalStep * format.height * whole_.tracking + beyond;
        cell.advance = cell.opensLetter ? step : 0.0;
    }
}

}  // namespace

std::vector<LineFormat> lineFormatsOf(MarkupText const& markup, LayoutStyle const& style) {
    std::vector<LayoutFace> faces{faceOfStyle(style)};
    for (MarkupFont const& font : markup.fonts) {
        faces.push_back(faceOfMarkup(font));
    }
    std::vector<LineFormat> formats;
    formats.reserve(markup.formats.size());
    for (MarkupFormat const& format : markup.formats) {
        formats.push_back(
            {faces[format.font], format.height, format.color, format.underline, format.overline});
    }
    return formats;
}

std::vector<Segment> buildSegments(MarkupText const& markup,
                                   std::vector<LineFormat> const& formats,
                                   WholeText const& whole) {
    return Builder(markup, formats, whole).build();
}

}  // namespace tzhost
