#include "host/drawing_file/limits.h"

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

char const* nameOf(Range range) {
    switch (range) {
    case Range::any: break;
    case Range::positive: return "a number above 0";
    case Range::size: return "a number, 0 or more";
    case Range::nonZero: return "a number other than 0";
    case Range::spacing: return "a number from 0.25 to 4";
    case Range::enlargement: return "a number from 1 to 5";
    }
    return "a number";
}

}  // namespace tzhost::drawingfile
