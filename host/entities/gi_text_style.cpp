#include "tz/gi/text_style.h"

#include "host/database/symbol_imp.h"
#include "host/entities/style_look.h"
#include "host/layout/line_layout.h"

void TzGiTextStyle::setFont(
    TzString const& typeface, bool bold, bool italic, int charset, int pitchAndFamily) {
    typeface_ = typeface;
    bold_ = bold;
    italic_ = italic;
    charset_ = charset;
    pitchAndFamily_ = pitchAndFamily;
}

TzGePoint2d TzGiTextStyle::extents(
    wchar_t const* text, bool /*penUps*/, int length, bool raw, TzGiWorldDraw* /*draw*/) const {
    if (tzhost::faultStatus("TzGiTextStyle::extents")) return {};
    tzhost::LineLayoutInput input;
    input.text = text ? text : L"";
    if (length >= 0 && static_cast<std::size_t>(length) < input.text.size()) {
        input.text.resize(static_cast<std::size_t>(length));
    }
    if (!raw) input.text = tzhost::decodeLineText(input.text);
    input.textHeight = textSize_;
    input.tracking = tracking_;
    input.style = {fileName_.str(), bigFontFileName_.str(),
                   typeface_.str(), bold_,
                   italic_,         charset_,
                   pitchAndFamily_, xScale_,
                   obliquingAngle_, vertical_,
                   backward_,       upsideDown_};
    tzhost::dropVerticalMark(input.style);
    tzhost::LayoutBox const box = tzhost::layOutLine(input).box;
    return {box.width(), box.height()};
}

Tzad::ErrorStatus fromTzDbTextStyle(TzGiTextStyle& style, TzDbObjectId id) {
    if (auto const fault = tzhost::faultStatus("fromTzDbTextStyle")) return fault;
    if (id.objectClass() != TzDbTextStyleTableRecord::desc()) return Tzad::eWrongObjectType;
    auto const& values = tzhost::valuesOf<tzhost::TextStyleImp>(*id.record()->object);
    tzhost::LayoutStyle const look = tzhost::lookOfStyle(id);
    style.setFileName(look.fontFile);
    style.setBigFontFileName(look.bigFontFile);
    style.setFont(look.typeface, look.bold, look.italic, look.charset, look.pitchAndFamily);
    if (values.height > 0.0) style.setTextSize(values.height);
    style.setXScale(look.widthFactor);
    style.setObliquingAngle(look.oblique);
    style.setVertical(look.vertical);
    style.setBackward(look.backward);
    style.setUpsideDown(look.upsideDown);
    return Tzad::eOk;
}
