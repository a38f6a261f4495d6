#include <cmath>

#include "host/base/entity_drawing.h"
#include "host/database/drawing.h"
#include "host/database/geometry.h"
#include "host/database/open_state.h"
#include "host/database/symbol_imp.h"
#include "host/entities/new_entity.h"
#include "host/entities/shape_imp.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"
#include "tz/gi/draw.h"

using tzhost::assign;
using tzhost::faultStatus;
using tzhost::InsertImp;
using tzhost::valuesOf;

TzDbBlockReference::TzDbBlockReference() : TzDbEntity(new InsertImp) {}

TzDbBlockReference::~TzDbBlockReference() = default;

TzDbObjectId TzDbBlockReference::blockTableRecord() const {
    return valuesOf<InsertImp>(*this).block;
}

// A block that leads back to the one that holds this reference is refused.
Tzad::ErrorStatus TzDbBlockReference::setBlockTableRecord(TzDbObjectId block) {
    bool const isBlock = block.objectClass() == TzDbBlockTableRecord::desc() && !block.isErased();
    TzDbObjectRecord const* const own = objectId().record();
    bool const isCyclic = isBlock && own && tzhost::leadsTo(*block.record(), *own->owner);
    return assign(*this, "TzDbBlockReference::setBlockTableRecord", &InsertImp::block, block,
                  isBlock && !isCyclic && tzhost::fitsDatabase(*this, block),
                  isBlock ? Tzad::eInvalidInput : Tzad::eWrongObjectType);
}

TzGePoint3d TzDbBlockReference::position() const {
    return valuesOf<InsertImp>(*this).position;
}

Tzad::ErrorStatus TzDbBlockReference::setPosition(TzGePoint3d const& position) {
    return assign(*this, "TzDbBlockReference::setPosition", &InsertImp::position, position,
                  tzhost::isFinite(position), Tzad::eDegenerateGeometry);
}

TzGeVector3d TzDbBlockReference::normal() const {
    return valuesOf<InsertImp>(*this).normal;
}

Tzad::ErrorStatus TzDbBlockReference::setNormal(TzGeVector3d const& normal) {
    bool const valid = tzhost::isDirection(normal);
    return assign(*this, "TzDbBlockReference::setNormal", &InsertImp::normal,
                  valid ? tzhost::unitVector(normal) : normal, valid, Tzad::eDegenerateGeometry);
}

double TzDbBlockReference::rotation() const {
    return valuesOf<InsertImp>(*this).rotation;
}

Tzad::ErrorStatus TzDbBlockReference::setRotation(double radians) {
    return assign(*this, "TzDbBlockReference::setRotation", &InsertImp::rotation, radians,
                  std::isfinite(radians), Tzad::eDegenerateGeometry);
}

double TzDbBlockReference::scale() const {
    return valuesOf<InsertImp>(*this).scale;
}

Tzad::ErrorStatus TzDbBlockReference::setScale(double factor) {
    return assign(*this, "TzDbBlockReference::setScale", &InsertImp::scale, factor,
                  std::isfinite(factor) && factor != 0.0);
}

TzGeMatrix3d TzDbBlockReference::blockTransform() const {
    InsertImp const& values = valuesOf<InsertImp>(*this);
    TzGeVector3d const along = tzhost::directionAt(values.normal, values.rotation);
    TzGeMatrix3d placed;
    placed.setCoordSystem(values.position, along * values.scale,
                          values.normal.crossProduct(along) * values.scale,
                          values.normal * values.scale);
    if (values.block.isNull()) return placed;
    TzGePoint3d const base = valuesOf<tzhost::BlockImp>(*values.block.record()->object).origin;
    return placed * TzGeMatrix3d::translation(-base.asVector());
}

Tzad::ErrorStatus TzDbBlockReference::appendAttribute(TzDbObjectId& id, TzDbAttribute* attribute) {
    id.setNull();
    if (auto const fault = faultStatus("TzDbBlockReference::appendAttribute")) return fault;
    return tzhost::appendEntity(*this, id, attribute);
}

void TzDbBlockReference::attributes(TzArray<TzDbObjectId>& ids) const {
    ids.removeAll();
    for (TzDbObjectRecord* const each : valuesOf<InsertImp>(*this).attributes->items) {
        if (!each->erased) ids.append(TzDbObjectId(each));
    }
}

// Definitions of attributes show in their block alone; each reference shows attributes of its own.
bool TzDbBlockReference::subWorldDraw(TzGiWorldDraw* draw) {
    if (!draw || tzhost::takenWhole(draw, *this, L"INSERT", position())) return true;
    InsertImp const& values = valuesOf<InsertImp>(*this);
    if (!values.block.isNull()) {
        draw->geometry().pushModelTransform(blockTransform());
        auto const& block = valuesOf<tzhost::BlockImp>(*values.block.record()->object);
        for (TzDbObjectRecord const* const each : block.entities->items) {
            if (each->erased || each->object->isA() == TzDbAttributeDefinition::desc()) continue;
            draw->geometry().draw(each->object);
        }
        draw->geometry().popModelTransform();
    }
    for (TzDbObjectRecord const* const each : values.attributes->items) {
        if (!each->erased) draw->geometry().draw(each->object);
    }
    return true;
}

Tzad::ErrorStatus TzDbBlockReference::subTransformBy(TzGeMatrix3d const& matrix) {
    InsertImp const& now = valuesOf<InsertImp>(*this);
    auto const turned = tzhost::transformed(matrix, now.position, now.normal,
                                            tzhost::directionAt(now.normal, now.rotation));
    if (!turned || !std::isfinite(now.scale * turned->scaleAlong) ||
        now.scale * turned->scaleAlong == 0.0) {
        return Tzad::eDegenerateGeometry;
    }
    if (auto const status = tzhost::beginChange(*this)) return status;
    InsertImp& values = valuesOf<InsertImp>(*this);
    values.position = turned->origin;
    values.normal = turned->normal;
    TzGeVector3d const zero = tzhost::directionAt(turned->normal, 0.0);
    values.rotation = tzhost::angleAbout(turned->normal, zero, turned->direction);
    values.scale *= turned->scaleAlong;
    if (objectId().isNull()) return Tzad::eOk;  // the attributes are the original's
    for (TzDbObjectRecord* const each : values.attributes->items) {
        if (each->erased) continue;
        tzhost::HostOpening const opening(*each);
        // One that cannot be moved stays alone.
        (void)static_cast<TzDbEntity*>(each->object)->transformBy(matrix);
    }
    return Tzad::eOk;
}
