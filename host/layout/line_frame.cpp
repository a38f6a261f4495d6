#include <algorithm>

#include "host/layout/line_placing.h"

namespace tzhost {

AttachmentShares attachmentShares(int attachment) {
    int const index = attachment >= 1 && attachment <= 9 ? attachment - 1 : 0;
    int const row = index / 3;
    int const column = index % 3;
    return {column / 2.0, row / 2.0};
}

LayoutBox boxAt(AttachmentShares const& shares, double width, double height) {
    LayoutBox box;
    box.left = -shares.along * width;
    box.right = box.left + width;
    box.top = shares.down * height;
    box.bottom = box.top - height;
    return box;
}

LineFrame frameOf(BrokenText const& broken, double share) {
    LineFrame frame{share, broken.wrapWidth};
    if (broken.wrapWidth <= 0.0) {
        frame.width = 0.0;
        for (LaidLine const& laid : broken.lines) {
            frame.width = std::max(frame.width, laid.line.indent + laid.line.advance);
        }
    }
    return frame;
}

double LineFrame::offset(SegmentLine const& line) const {
    return line.indent + share * (width - line.indent - line.advance);
}

double LineFrame::measure(std::vector<LaidLine> const& lines) const {
    double before = 0.0;
    double behind = 0.0;
    for (LaidLine const& laid : lines) {
        double const start = offset(laid.line) - share * width;
        before = std::max(before, -start);
        behind = std::max(behind, start + laid.line.advance);
    }
    if (share == 0.0) {
        return behind;
    }
    return share == 1.0 ? before : 2.0 * std::max(before, behind);
}

}  // namespace tzhost
