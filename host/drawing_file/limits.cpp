#include "host/drawing_file/limits.h"

#include "host/text/local_text.h"

namespace tzhost::drawingfile {

bool isIn(Range range, double value) {
    switch (range) {
    case Range::any: break;
    case Range::positive: return value > 0.0;
    case Range::size: return value >= 0.0;
    case Range::nonZero: return value != 0.0;
    case Range::spacing: return value >= 0.25 && value <= 4.0;
    case Range::enlargement: return value >= 1.0 && value <= 5.0;
    }
    return true;
}

std::string nameOf(Range range) {
    switch (range) {
    case Range::any: break;
    case Range::positive: return localText("a number above 0");
    case Range::size: return localText("a number, 0 or more");
    case Range::nonZero: return localText("a number other than 0");
    case Range::spacing: return localText("a number from 0.25 to 4");
    case Range::enlargement: return localText("a number from 1 to 5");
    }
    return localText("a number");
}

}  // namespace tzhost::drawingfile
