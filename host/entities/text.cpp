#include "tz/db/text.h"

#include <cmath>

#include "host/base/entity_drawing.h"
#include "host/database/geometry.h"
#include "host/entities/text_drawing.h"
#include "host/entities/text_imp.h"
#include "tz/db/symbol_table.h"

using tzhost::assign;
using tzhost::faultStatus;
using tzhost::reshape;
using tzhost::TextImp;
using tzhost::valuesOf;

TzDbText::TzDbText() : TzDbEntity(new TextImp) {}

TzDbText::TzDbText(TzDbObjectImp* imp) : TzDbEntity(imp) {}

TzDbText::~TzDbText() = default;

TzGePoint3d TzDbText::position() const {
    return valuesOf<TextImp>(*this).position();
}

Tzad::ErrorStatus TzDbText::setPosition(TzGePoint3d const& position) {
    TextImp const& values = valuesOf<TextImp>(*this);
    // Without going through a difference, which would round the numbers.
    TzGePoint3d const point = values.justification == kLeft
                                  ? position
                                  : values.alignmentPoint + (position - values.position());
    return assign(*this, "TzDbText::setPosition", &TextImp::alignmentPoint, point,
                  tzhost::isFinite(point), Tzad::eDegenerateGeometry);
}

TzDbText::Justification TzDbText::justification() const {
    return valuesOf<TextImp>(*this).justification;
}

Tzad::ErrorStatus TzDbText::setJustification(Justification justification) {
    return assign(*this, "TzDbText::setJustification", &TextImp::justification, justification,
                  justification >= kLeft && justification < kJustifications);
}

TzGePoint3d TzDbText::alignmentPoint() const {
    return valuesOf<TextImp>(*this).alignmentPoint;
}

Tzad::ErrorStatus TzDbText::setAlignmentPoint(TzGePoint3d const& point) {
    return assign(*this, "TzDbText::setAlignmentPoint", &TextImp::alignmentPoint, point,
                  tzhost::isFinite(point), Tzad::eDegenerateGeometry);
}

TzGeVector3d TzDbText::normal() const {
    return valuesOf<TextImp>(*this).normal;
}

Tzad::ErrorStatus TzDbText::setNormal(TzGeVector3d const& normal) {
    bool const valid = tzhost::isDirection(normal);
    return assign(*this, "TzDbText::setNormal", &TextImp::normal,
                  valid ? tzhost::unitVector(normal) : normal, valid, Tzad::eDegenerateGeometry);
}

double TzDbText::rotation() const {
    return valuesOf<TextImp>(*this).rotation;
}

Tzad::ErrorStatus TzDbText::setRotation(double radians) {
    return assign(*this, "TzDbText::setRotation", &TextImp::rotation, radians,
                  std::isfinite(radians), Tzad::eDegenerateGeometry);
}

double TzDbText::height() const {
    return valuesOf<TextImp>(*this).height;
}

Tzad::ErrorStatus TzDbText::setHeight(double height) {
    return reshape(*this, "TzDbText::setHeight", &TextImp::height, height,
                   tzhost::isPositive(height));
}

double TzDbText::widthFactor() const {
    return valuesOf<TextImp>(*this).widthFactor;
}

Tzad::ErrorStatus TzDbText::setWidthFactor(double factor) {
    return reshape(*this, "TzDbText::setWidthFactor", &TextImp::widthFactor, factor,
                   tzhost::isPositive(factor));
}

double TzDbText::oblique() const {
    return valuesOf<TextImp>(*this).oblique;
}

Tzad::ErrorStatus TzDbText::setOblique(double radians) {
    return reshape(*this, "TzDbText::setOblique", &TextImp::oblique, radians,
                   std::isfinite(radians));
}

TzDbObjectId TzDbText::textStyle() const {
    return valuesOf<TextImp>(*this).style;
}

Tzad::ErrorStatus TzDbText::setTextStyle(TzDbObjectId style) {
    bool const isStyle =
        style.objectClass() == TzDbTextStyleTableRecord::desc() && !style.isErased();
    TzDbObjectId tzhost::TextStyledImp::*const member = &tzhost::TextStyledImp::style;
    return reshape(*this, "TzDbText::setTextStyle", member, style,
                   isStyle && tzhost::fitsDatabase(*this, style),
                   isStyle ? Tzad::eWrongDatabase : Tzad::eWrongObjectType);
}

TzString TzDbText::textString() const {
    return valuesOf<TextImp>(*this).text;
}

Tzad::ErrorStatus TzDbText::setTextString(wchar_t const* text) {
    return reshape(*this, "TzDbText::setTextString", &TextImp::text,
                   std::wstring(text ? text : L""));
}

bool TzDbText::isPlanar() const {
    return true;
}

Tzad::ErrorStatus TzDbText::getPlane(TzGePlane& plane, TzDb::Planarity& planarity) const {
    if (auto const fault = faultStatus("TzDbText::getPlane")) return fault;
    plane = TzGePlane(position(), normal());
    planarity = TzDb::kPlanar;
    return Tzad::eOk;
}

namespace {

tzhost::TextFrame frameOf(TextImp const& values) {
    return {values.position(), tzhost::directionAt(values.normal, values.rotation), values.normal};
}

// Draws a single line unless the display takes the entity whole.
void drawLine(TzGiWorldDraw* draw, TzDbText const& text, wchar_t const* kind) {
    if (!draw || tzhost::takenWhole(draw, text, kind, text.position())) return;
    TextImp const& values = valuesOf<TextImp>(text);
    tzhost::drawRuns(*draw, frameOf(values), values.layout().runs);
}

}  // namespace

bool TzDbText::subWorldDraw(TzGiWorldDraw* draw) {
    drawLine(draw, *this, isA() == TzDbAttribute::desc() ? L"ATTRIB" : L"TEXT");
    return true;
}

Tzad::ErrorStatus TzDbText::subTransformBy(TzGeMatrix3d const& matrix) {
    TextImp const& now = valuesOf<TextImp>(*this);
    tzhost::TextFrame const frame{now.alignmentPoint, tzhost::directionAt(now.normal, now.rotation),
                                  now.normal};
    auto const turned = tzhost::transformed(matrix, frame.origin, frame.normal, frame.direction);
    double const factor = turned ? now.widthFactor * turned->scaleAlong / turned->scaleUp : 0.0;
    if (!turned || !tzhost::isPositive(now.height * turned->scaleUp) ||
        !tzhost::isPositive(factor)) {
        return Tzad::eDegenerateGeometry;
    }
    if (auto const status = tzhost::beginChange(*this)) return status;
    TextImp& values = valuesOf<TextImp>(*this);
    values.alignmentPoint = turned->origin;
    bool const isTurned = turned->direction != frame.direction || turned->normal != frame.normal;
    values.normal = turned->normal;
    if (isTurned) {
        TzGeVector3d const zero = tzhost::directionAt(turned->normal, 0.0);
        values.rotation = tzhost::angleAbout(turned->normal, zero, turned->direction);
    }
    if (!turned->isScaled()) return Tzad::eOk;
    values.height *= turned->scaleUp;
    values.widthFactor = factor;
    values.forgetComputed();
    return Tzad::eOk;
}
