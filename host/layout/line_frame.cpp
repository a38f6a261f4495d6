#include <algorithm>

#include "host/layout/line_placing.h"

namespace tzhost {

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
    double after = 0.0;
    for (LaidLine const& laid : lines) {
        double const start = offset(laid.line) - share * width;
        before = std::max(before, -start);
        after = std::max(after, start + laid.line.advance);
    }
    if (share == 0.0) {
        return after;
    }
    return share == 1.0 ? before : 2.0 * std::max(before, after);
}

}  // namespace tzhost
