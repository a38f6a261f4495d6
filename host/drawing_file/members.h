#pragma once

#include "host/database/symbol_imp.h"
#include "host/drawing_file/member_reader.h"
#include "host/drawing_file/member_writer.h"
#include "host/entities/mtext_imp.h"
#include "host/entities/shape_imp.h"
#include "host/entities/text_imp.h"

// What a drawing file says of each class, once for reading and writing: `Members` is a MemberReader
// or a MemberWriter. Members are written in the order in which they stand here.
namespace tzhost::drawingfile {

inline constexpr WholeRange kEntityColors{0, 256};
inline constexpr WholeRange kLayerColors{1, 255};
inline constexpr WholeRange kByte{0, 255};

// What reading and writing do differently.
void describeHeights(MemberReader& members, TextEditorColumns& columns);
void describeHeights(MemberWriter& members, TextEditorColumns& columns);
void describeColumns(MemberReader& members, MTextImp& values);
void describeColumns(MemberWriter& members, MTextImp& values);
void describeBackground(MemberReader& members, MTextImp& values);
void describeBackground(MemberWriter& members, MTextImp& values);
void describeTransparency(MemberReader& members, TzCmTransparency& transparency);
void describeTransparency(MemberWriter& members, TzCmTransparency& transparency);
// A text's place: a justified one has two points.
void describePlace(MemberReader& members, TextImp& values);
void describePlace(MemberWriter& members, TextImp& values);
void describeLines(MemberReader& members, DefinitionImp& values);
void describeLines(MemberWriter& members, DefinitionImp& values);
// A direction that is parallel to the normal is malformed; another is turned to a right angle.
void settleAxes(MemberReader& members, MTextImp& values);
void settleAxes(MemberWriter& members, MTextImp& values);

template <class Members>
void describe(Members& members, EntityImp& values) {
    members.layer("layer", values.layer);
    members.color("color", values.color, kEntityColors);
    members.flag("visible", values.visible);
}

template <class Members>
void describe(Members& members, TextEditorColumns& columns) {
    members.whole("type", columns.columnType, WholeRange{0, 2});
    members.flag("autoHeight", columns.autoHeight);
    members.whole("count", columns.columnCount, WholeRange{0, 1000});
    members.number("width", columns.columnWidth, Range::size);
    members.number("gutter", columns.columnGutter, Range::size);
    describeHeights(members, columns);
}

template <class Members>
void describe(Members& members, MTextBackground& background) {
    members.flag("fill", background.fill);
    members.color("color", background.color, kEntityColors);
    members.number("scale", background.scale, Range::enlargement);
    members.flag("useBackgroundColor", background.useBackgroundColor);
    describeTransparency(members, background.transparency);
}

template <class Members>
void describeOwn(Members& members, MTextImp& values) {
    members.point("location", values.location);
    members.direction("normal", values.normal);
    members.direction("direction", values.direction);
    settleAxes(members, values);
    members.number("textHeight", values.textHeight, Range::positive);
    members.number("width", values.width, Range::size);
    members.number("height", values.height, Range::size);
    members.whole("attachment", values.attachment, WholeRange{1, 9});
    members.textStyle("style", values.style);
    members.text("contents", values.contents);
    members.whole("lineSpacingStyle", values.lineSpacingStyle, WholeRange{1, 2});
    members.number("lineSpacingFactor", values.lineSpacingFactor, Range::spacing);
    describeColumns(members, values);
    members.flag("annotative", values.annotative);
    members.flag("paperOrientation", values.paperOrientation);
    describeBackground(members, values);
}

template <class Members>
void describeOwn(Members& members, TextImp& values) {
    describePlace(members, values);
    members.direction("normal", values.normal);
    members.number("rotation", values.rotation, Range::any);
    members.number("textHeight", values.height, Range::positive);
    members.text("text", values.text);
    members.textStyle("style", values.style);
    members.number("widthFactor", values.widthFactor, Range::positive);
    members.number("oblique", values.oblique, Range::any);
    members.flag("annotative", values.annotative);
    members.flag("paperOrientation", values.paperOrientation);
}

template <class Members>
void describeOwn(Members& members, DefinitionImp& values) {
    describeOwn(members, static_cast<TextImp&>(values));
    members.text("tag", values.tag);
    members.text("prompt", values.prompt);
    describeLines(members, values);
}

template <class Members>
void describeOwn(Members& members, AttributeImp& values) {
    describeOwn(members, static_cast<TextImp&>(values));
    members.text("tag", values.tag);
}

template <class Members>
void describeOwn(Members& members, LineImp& values) {
    members.point("start", values.start);
    members.point("end", values.end);
}

template <class Members>
void describeOwn(Members& members, CircleImp& values) {
    members.point("center", values.center);
    members.direction("normal", values.normal);
    members.number("radius", values.radius, Range::positive);
}

// The block's name and the attributes are handled apart.
template <class Members>
void describeOwn(Members& members, InsertImp& values) {
    members.point("position", values.position);
    members.direction("normal", values.normal);
    members.number("rotation", values.rotation, Range::any);
    members.number("scale", values.scale, Range::nonZero);
}

template <class Members>
void describe(Members& members, LayerImp& values) {
    members.color("color", values.color, kLayerColors);
    members.flag("locked", values.locked);
    members.flag("off", values.off);
}

template <class Members>
void describe(Members& members, LinetypeImp& values) {
    members.numbers("dashes", values.dashes, Range::any);
}

template <class Members>
void describe(Members& members, TextStyleImp& values) {
    bool backward = (values.flagBits & 2) != 0;
    bool upsideDown = (values.flagBits & 4) != 0;
    members.text("fontFile", values.fontFile);
    members.text("bigFontFile", values.bigFontFile);
    members.text("typeface", values.typeface);
    members.flag("bold", values.bold);
    members.flag("italic", values.italic);
    members.whole("charset", values.charset, kByte);
    members.whole("pitchAndFamily", values.pitchAndFamily, kByte);
    members.number("height", values.height, Range::size);
    members.number("widthFactor", values.widthFactor, Range::positive);
    members.number("oblique", values.oblique, Range::any);
    members.flag("vertical", values.vertical);
    members.flag("backward", backward);
    members.flag("upsideDown", upsideDown);
    members.flag("annotative", values.annotative);
    members.flag("paperOrientation", values.paperOrientation);
    values.flagBits = (backward ? 2 : 0) | (upsideDown ? 4 : 0);
}

template <class Members>
void describe(Members& members, BlockImp& values) {
    members.point("origin", values.origin);
}

}  // namespace tzhost::drawingfile
