#include "host/layout/glyph_run.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace tzhost {

double usableFactor(double factor) {
    return factor > 0.0 && std::isfinite(factor) ? factor : 1.0;
}

double usableSlant(double radians) {
    constexpr double kMost = 85.0 * std::numbers::pi / 180.0;
    return std::clamp(std::remainder(radians, 2.0 * std::numbers::pi), -kMost, kMost);
}

namespace {

// Down the page tracking parts the letters and widens nothing.
double trackingOf(WholeText const& whole) {
    return whole.flow == TextFlow::along ? whole.tracking : 1.0;
}

}  // namespace

Ligatures ligaturesOf(WholeText const& whole) {
    bool const isParted = whole.flow == TextFlow::down || whole.tracking != 1.0;
    return isParted ? Ligatures::off : Ligatures::on;
}

double advanceScale(LineFormat const& format, WholeText const& whole) {
    return format.height * whole.widthFactor * trackingOf(whole);
}

GlyphRun makeGlyphRun(std::wstring const& text, LineFormat const& format, WholeText const& whole) {
    GlyphRun run;
    run.text = text;
    run.height = format.height;
    run.widthFactor = whole.widthFactor;
    run.tracking = trackingOf(whole);
    run.oblique = whole.oblique;
    run.face = format.face;
    run.color = format.color;
    return run;
}

GlyphRun shapeGlyphRun(std::wstring const& text, LineFormat const& format, WholeText const& whole) {
    GlyphRun run = makeGlyphRun(text, format, whole);
    ShapedLine const line = shapeLine(text, format.face, ligaturesOf(whole));
    run.advance = line.advance * advanceScale(format, whole);
    run.rightToLeft = line.rightToLeft;
    return run;
}

}  // namespace tzhost
