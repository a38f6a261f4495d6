#include "module/mtext/sample_text.h"

#include "module/host_calls/sys_var.h"
#include "module/styles/style_rules.h"

namespace {

TzDbObjectId currentStyle() {
    return GetTextStyleID(GetCurrentTextStyleName());
}

}  // namespace

double rotationOfCurrentStyle() {
    return IsVerticalTTF() ? kVerticalRotation : 0.0;
}

bool isCurrentStyleVertical() {
    TzDbObjectId const id = currentStyle();
    if (id.isNull()) return false;
    TzGiTextStyle style;
    (void)fromTzDbTextStyle(style, id);  // a style that cannot be read is not vertical
    return style.isVertical();
}

TzGiTextStyle sampleTextStyle(double size, bool vertical) {
    TzGiTextStyle style;
    TzDbObjectId const id = currentStyle();
    if (id.isNull()) return style;
    (void)fromTzDbTextStyle(style, id);  // a style that cannot be read leaves the plain font
    style.setTextSize(size);
    style.setUpsideDown(false);
    style.setBackward(false);
    style.setVertical(vertical);
    return style;
}

TzString sampleText() {
    return CTzadSysVar::GetString(L"MTJIGSTRING");
}

void drawSampleText(TzGiWorldDraw& draw,
                    TzString const& text,
                    TzGePoint3d const& position,
                    TzGeVector3d const& normal,
                    TzGeVector3d const& direction,
                    TzGiTextStyle const& style) {
    draw.geometry().text(position, normal, direction, text, text.length(), true, style);
}
