#include "tz/db/mtext.h"

#include <cmath>

#include "host/database/geometry.h"
#include "host/database/user_system.h"
#include "host/entities/mtext_imp.h"
#include "host/fields/field_links.h"
#include "tz/db/field.h"
#include "tz/db/symbol_table.h"

using tzhost::assign;
using tzhost::faultStatus;
using tzhost::MTextImp;
using tzhost::reshape;
using tzhost::valuesOf;

TzDbMText::TzDbMText() : TzDbEntity(new MTextImp) {}

TzDbMText::~TzDbMText() = default;

TzGePoint3d TzDbMText::location() const {
    return valuesOf<MTextImp>(*this).location;
}

Tzad::ErrorStatus TzDbMText::setLocation(TzGePoint3d const& location) {
    return assign(*this, "TzDbMText::setLocation", &MTextImp::location, location,
                  tzhost::isFinite(location), Tzad::eDegenerateGeometry);
}

TzGeVector3d TzDbMText::normal() const {
    return valuesOf<MTextImp>(*this).normal;
}

Tzad::ErrorStatus TzDbMText::setNormal(TzGeVector3d const& normal) {
    bool const valid = tzhost::isDirection(normal);
    TzGeVector3d const unit = valid ? tzhost::unitVector(normal) : normal;
    auto const status = assign(*this, "TzDbMText::setNormal", &MTextImp::normal, unit, valid,
                               Tzad::eDegenerateGeometry);
    if (status) return status;
    TzGeVector3d& direction = valuesOf<MTextImp>(*this).direction;
    direction =
        direction.isParallelTo(unit) ? unit.perpVector() : tzhost::perpendicularTo(unit, direction);
    return Tzad::eOk;
}

TzGeVector3d TzDbMText::direction() const {
    return valuesOf<MTextImp>(*this).direction;
}

Tzad::ErrorStatus TzDbMText::setDirection(TzGeVector3d const& direction) {
    bool const valid = tzhost::isDirection(direction) && !direction.isParallelTo(normal());
    return assign(*this, "TzDbMText::setDirection", &MTextImp::direction,
                  valid ? tzhost::perpendicularTo(normal(), direction) : direction, valid,
                  Tzad::eDegenerateGeometry);
}

namespace {

// Where angles of a text start: the user system's X axis in its plane.
TzGeVector3d zeroDirection(TzDbMText const& text) {
    TzGeVector3d const axis = tzhost::currentUserSystem(text.database()).xAxis;
    TzGeVector3d const normal = text.normal();
    return axis.isParallelTo(normal) ? normal.perpVector() : tzhost::perpendicularTo(normal, axis);
}

}  // namespace

double TzDbMText::rotation() const {
    return tzhost::angleAbout(normal(), zeroDirection(*this), direction());
}

// The angle that the text has leaves its direction as it is, to the last bit: made anew from the
// angle it would be another in every eighth text.
Tzad::ErrorStatus TzDbMText::setRotation(double radians) {
    bool const valid = std::isfinite(radians);
    bool const isNew = radians != rotation();
    TzGeVector3d direction = isNew ? zeroDirection(*this) : this->direction();
    if (valid && isNew) direction.rotateBy(radians, normal());
    return assign(*this, "TzDbMText::setRotation", &MTextImp::direction, direction, valid,
                  Tzad::eDegenerateGeometry);
}

double TzDbMText::textHeight() const {
    return valuesOf<MTextImp>(*this).textHeight;
}

Tzad::ErrorStatus TzDbMText::setTextHeight(double height) {
    return reshape(*this, "TzDbMText::setTextHeight", &MTextImp::textHeight, height,
                   tzhost::isPositive(height));
}

double TzDbMText::width() const {
    return valuesOf<MTextImp>(*this).width;
}

Tzad::ErrorStatus TzDbMText::setWidth(double width) {
    return reshape(*this, "TzDbMText::setWidth", &MTextImp::width, width, tzhost::isSize(width));
}

double TzDbMText::height() const {
    return valuesOf<MTextImp>(*this).height;
}

Tzad::ErrorStatus TzDbMText::setHeight(double height) {
    return reshape(*this, "TzDbMText::setHeight", &MTextImp::height, height,
                   tzhost::isSize(height));
}

TzDbMText::AttachmentPoint TzDbMText::attachment() const {
    return static_cast<AttachmentPoint>(valuesOf<MTextImp>(*this).attachment);
}

Tzad::ErrorStatus TzDbMText::setAttachment(AttachmentPoint point) {
    return reshape(*this, "TzDbMText::setAttachment", &MTextImp::attachment,
                   static_cast<short>(point), point >= kTopLeft && point <= kBottomRight);
}

Tzad::ErrorStatus TzDbMText::setAttachmentMovingLocation(AttachmentPoint point) {
    if (auto const fault = faultStatus("TzDbMText::setAttachmentMovingLocation")) return fault;
    if (point < kTopLeft || point > kBottomRight) return Tzad::eOutOfRange;
    if (auto const status = tzhost::beginChange(*this)) return status;
    MTextImp& values = valuesOf<MTextImp>(*this);
    auto const next = static_cast<short>(point);
    values.location = values.placeOf(next);
    values.attachment = next;
    values.forgetComputed();
    return Tzad::eOk;
}

TzDbObjectId TzDbMText::textStyle() const {
    return valuesOf<MTextImp>(*this).style;
}

Tzad::ErrorStatus TzDbMText::setTextStyle(TzDbObjectId style) {
    bool const isStyle =
        style.objectClass() == TzDbTextStyleTableRecord::desc() && !style.isErased();
    TzDbObjectId tzhost::TextStyledImp::*const member = &tzhost::TextStyledImp::style;
    return reshape(*this, "TzDbMText::setTextStyle", member, style,
                   isStyle && tzhost::fitsDatabase(*this, style),
                   isStyle ? Tzad::eWrongDatabase : Tzad::eWrongObjectType);
}

TzDb::LineSpacingStyle TzDbMText::lineSpacingStyle() const {
    return static_cast<TzDb::LineSpacingStyle>(valuesOf<MTextImp>(*this).lineSpacingStyle);
}

Tzad::ErrorStatus TzDbMText::setLineSpacingStyle(TzDb::LineSpacingStyle style) {
    return reshape(*this, "TzDbMText::setLineSpacingStyle", &MTextImp::lineSpacingStyle,
                   static_cast<short>(style), style == TzDb::kAtLeast || style == TzDb::kExactly);
}

double TzDbMText::lineSpacingFactor() const {
    return valuesOf<MTextImp>(*this).lineSpacingFactor;
}

Tzad::ErrorStatus TzDbMText::setLineSpacingFactor(double factor) {
    constexpr double kLeast = 0.25;
    constexpr double kMost = 4.0;
    return reshape(*this, "TzDbMText::setLineSpacingFactor", &MTextImp::lineSpacingFactor, factor,
                   factor >= kLeast && factor <= kMost);
}

TzString TzDbMText::contents() const {
    return valuesOf<MTextImp>(*this).contents;
}

// A new text takes the place of an old field; codes in it become a field at once when the text is
// in a drawing, else when it is added to one.
Tzad::ErrorStatus TzDbMText::setContents(wchar_t const* contents) {
    auto const status = reshape(*this, "TzDbMText::setContents", &MTextImp::contents,
                                std::wstring(contents ? contents : L""));
    if (status == Tzad::eOk) tzhost::renewTextField(*this);
    return status;
}

wchar_t const* TzDbMText::paragraphBreak() {
    return L"\\P";
}

double TzDbMText::actualWidth(TzGiWorldDraw* /*draw*/) const {
    return valuesOf<MTextImp>(*this).size().x;
}

double TzDbMText::actualHeight(TzGiWorldDraw* /*draw*/) const {
    return valuesOf<MTextImp>(*this).size().y;
}

void TzDbMText::getBoundingPoints(TzArray<TzGePoint3d>& points) const {
    MTextImp const& values = valuesOf<MTextImp>(*this);
    tzhost::LayoutBox const box = values.box();
    points.removeAll();
    points.append(values.at({box.left, box.top}));
    points.append(values.at({box.right, box.top}));
    points.append(values.at({box.left, box.bottom}));
    points.append(values.at({box.right, box.bottom}));
}

bool TzDbMText::isPlanar() const {
    return true;
}

Tzad::ErrorStatus TzDbMText::getPlane(TzGePlane& plane, TzDb::Planarity& planarity) const {
    if (auto const fault = faultStatus("TzDbMText::getPlane")) return fault;
    plane = TzGePlane(location(), normal());
    planarity = TzDb::kPlanar;
    return Tzad::eOk;
}

namespace {

// Columns at another scale; false when one of them would have no finite size.
bool scale(TextEditorColumns& columns, double along, double up) {
    columns.columnWidth *= along;
    columns.columnGutter *= along;
    bool valid = tzhost::isSize(columns.columnWidth) && tzhost::isSize(columns.columnGutter);
    for (double& height : columns.heights) {
        height *= up;
        valid = valid && tzhost::isSize(height);
    }
    return valid;
}

}  // namespace

Tzad::ErrorStatus TzDbMText::subTransformBy(TzGeMatrix3d const& matrix) {
    MTextImp const& now = valuesOf<MTextImp>(*this);
    auto const turned = tzhost::transformed(matrix, now.location, now.normal, now.direction);
    auto columns = now.columns ? std::make_unique<TextEditorColumns>(*now.columns) : nullptr;
    if (!turned || !tzhost::isPositive(now.textHeight * turned->scaleUp) ||
        !tzhost::isSize(now.width * turned->scaleAlong) ||
        !tzhost::isSize(now.height * turned->scaleUp) ||
        (columns && !scale(*columns, turned->scaleAlong, turned->scaleUp))) {
        return Tzad::eDegenerateGeometry;
    }
    if (auto const status = tzhost::beginChange(*this)) return status;
    MTextImp& values = valuesOf<MTextImp>(*this);
    values.location = turned->origin;
    values.normal = turned->normal;
    values.direction = turned->direction;
    if (!turned->isScaled()) return Tzad::eOk;
    values.textHeight *= turned->scaleUp;
    values.width *= turned->scaleAlong;
    values.height *= turned->scaleUp;
    values.columns = std::move(columns);
    values.forgetComputed();
    return Tzad::eOk;
}
