#include "host/entities/style_look.h"

#include "host/database/drawing.h"
#include "host/database/symbol_imp.h"

namespace tzhost {

LayoutStyle lookOfStyle(TzDbObjectId style) {
    if (style.isNull() && workingDrawing()) style = workingDrawing()->textstyle();
    TextStyleImp const fresh;
    TextStyleImp const& values =
        style.isNull() ? fresh : valuesOf<TextStyleImp>(*style.record()->object);
    constexpr int kBackward = 2;
    constexpr int kUpsideDown = 4;
    return {values.fontFile,
            values.bigFontFile,
            values.typeface,
            values.bold,
            values.italic,
            values.charset,
            values.pitchAndFamily,
            values.widthFactor,
            values.oblique,
            values.vertical,
            (values.flagBits & kBackward) != 0,
            (values.flagBits & kUpsideDown) != 0};
}

}  // namespace tzhost
