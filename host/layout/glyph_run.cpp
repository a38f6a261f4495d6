#include "host/layout/glyph_run.h"

namespace tzhost {

double advanceScale(LineFormat const& format, WholeText const& whole) {
    return format.height * whole.widthFactor * whole.tracking;
}

GlyphRun makeGlyphRun(std::wstring const& text, LineFormat const& format, WholeText const& whole) {
    GlyphRun run;
    run.text = text;
    run.height = format.height;
    run.widthFactor = whole.widthFactor;
    run.tracking = whole.tracking;
    run.oblique = whole.oblique;
    run.face = format.face;
    run.color = format.color;
    return run;
}

}  // namespace tzhost
