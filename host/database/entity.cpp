#include "tz/db/entity.h"

#include "host/base/audit.h"
#include "host/base/event_sink.h"
#include "host/base/memory_faults.h"
#include "host/database/drawing.h"
#include "host/database/entity_imp.h"
#include "host/database/geometry.h"
#include "host/database/open_state.h"
#include "host/database/symbol_imp.h"
#include "host/settings/variables.h"
#include "tz/db/host_services.h"
#include "tz/gi/draw.h"

using tzhost::Drawing;
using tzhost::EntityImp;
using tzhost::faultStatus;
using tzhost::valuesOf;

// An entity of a module has the plain values of an entity too.
TzDbEntity::TzDbEntity(TzDbObjectImp* imp) : TzDbObject(imp ? imp : new EntityImp) {}

TzDbEntity::~TzDbEntity() = default;

void TzDbEntity::setDatabaseDefaults(TzDbDatabase* database) {
    Drawing const* const drawing = tzhost::drawingOf(database);
    if (!drawing || tzhost::beginChange(*this) != Tzad::eOk) return;
    EntityImp& values = valuesOf<EntityImp>(*this);
    values.layer = drawing->clayer();
    values.color = TzCmColor();
    values.visible = true;
    if (auto* const text = dynamic_cast<tzhost::TextStyledImp*>(&values)) {
        text->style = drawing->textstyle();
        text->forgetComputed();
    }
}

TzDbObjectId TzDbEntity::layerId() const {
    return valuesOf<EntityImp>(*this).layer;
}

Tzad::ErrorStatus TzDbEntity::setLayer(TzDbObjectId layer) {
    bool const isLayer = layer.objectClass() == TzDbLayerTableRecord::desc() && !layer.isErased();
    return tzhost::assign(*this, "TzDbEntity::setLayer", &EntityImp::layer, layer,
                          isLayer && tzhost::fitsDatabase(*this, layer),
                          isLayer ? Tzad::eWrongDatabase : Tzad::eWrongObjectType);
}

TzString TzDbEntity::layer() const {
    TzDbObjectId const id = layerId();
    return id.isNull() ? L"0" : valuesOf<tzhost::SymbolImp>(*id.record()->object).name;
}

TzCmColor TzDbEntity::color() const {
    return valuesOf<EntityImp>(*this).color;
}

int TzDbEntity::colorIndex() const {
    return color().colorIndex();
}

Tzad::ErrorStatus TzDbEntity::setColor(TzCmColor const& color) {
    return tzhost::assign(*this, "TzDbEntity::setColor", &EntityImp::color, color);
}

Tzad::ErrorStatus TzDbEntity::setColorIndex(int index) {
    TzCmColor const color = TzCmEntityColor::fromIndex(index);
    bool const valid = index >= 0 && index <= 256;
    return tzhost::assign(*this, "TzDbEntity::setColorIndex", &EntityImp::color, color, valid);
}

TzDb::Visibility TzDbEntity::visibility() const {
    return valuesOf<EntityImp>(*this).visible ? TzDb::kVisible : TzDb::kInvisible;
}

// Showing is done even when the fault plan makes it report a failure; hiding is not.
Tzad::ErrorStatus TzDbEntity::setVisibility(TzDb::Visibility visibility, bool /*doSubents*/) {
    Tzad::ErrorStatus const fault = faultStatus("TzDbEntity::setVisibility");
    bool const visible = visibility == TzDb::kVisible;
    if (fault && !visible) return fault;
    if (auto const status = tzhost::beginChange(*this)) return status;
    valuesOf<EntityImp>(*this).visible = visible;
    return fault;
}

namespace {

void markHighlighted(TzDbObjectRecord& record, bool on) {
    if (record.highlighted != on) tzhost::audit().highlighted += on ? 1 : -1;
    record.highlighted = on;
    tzhost::reportEvent([&] {
        return tzhost::Event{{"event", "highlight"},
                             {"handle", tzhost::utf8(tzhost::handleText(record.handle))},
                             {"on", on}};
    });
}

}  // namespace

Tzad::ErrorStatus TzDbEntity::highlight(TzDbFullSubentPath const& /*path*/, bool /*all*/) const {
    if (auto const fault = faultStatus("TzDbEntity::highlight")) return fault;
    TzDbObjectRecord* const record = tzhost::openRecordOf(*this);
    if (!record) return Tzad::eNoDatabase;
    if (!isReadEnabled()) return Tzad::eNotOpenForRead;
    markHighlighted(*record, true);
    return Tzad::eOk;
}

Tzad::ErrorStatus TzDbEntity::unhighlight(TzDbFullSubentPath const& /*path*/, bool /*all*/) const {
    tzhost::MemoryFaultPause const givesBack;
    Tzad::ErrorStatus const fault = faultStatus("TzDbEntity::unhighlight");
    TzDbObjectRecord* const record = tzhost::openRecordOf(*this);
    if (!record) return Tzad::eNoDatabase;
    if (!isReadEnabled()) return Tzad::eNotOpenForRead;
    markHighlighted(*record, false);
    return fault;
}

bool TzDbEntity::isPlanar() const {
    return false;
}

Tzad::ErrorStatus TzDbEntity::getPlane(TzGePlane& /*plane*/, TzDb::Planarity& planarity) const {
    planarity = TzDb::kNonPlanar;
    return Tzad::eNotApplicable;
}

Tzad::ErrorStatus TzDbEntity::transformBy(TzGeMatrix3d const& matrix) {
    if (auto const fault = faultStatus("TzDbEntity::transformBy")) return fault;
    if (!isWriteEnabled()) return Tzad::eNotOpenForWrite;
    if (!tzhost::isFinite(matrix) || matrix.isSingular()) return Tzad::eDegenerateGeometry;
    return subTransformBy(matrix);
}

Tzad::ErrorStatus TzDbEntity::subTransformBy(TzGeMatrix3d const& /*matrix*/) {
    return Tzad::eNotApplicable;
}

unsigned int TzDbEntity::subSetAttributes(TzGiDrawableTraits* traits) {
    EntityImp const& values = valuesOf<EntityImp>(*this);
    if (traits) {
        traits->setTrueColor(values.color);
        traits->setLayer(values.layer);
        traits->setLineType(TzDbObjectId::kNull);
        traits->setFillType(0);
        traits->setTransparency(TzCmTransparency());
    }
    return 0;
}

bool TzDbEntity::subWorldDraw(TzGiWorldDraw* /*draw*/) {
    return true;
}

void TzDbEntity::subViewportDraw(TzGiViewportDraw* /*draw*/) {}

void TzTextSetLayer::setTextLayer(TzDbEntity* entity) {
    if (!entity || faultStatus("TzTextSetLayer::setTextLayer")) return;
    Drawing const* drawing = tzhost::drawingOf(entity->database());
    if (!drawing) return;
    std::wstring const name = tzhost::Variables::instance().text(L"TEXTLAYER");
    TzDbObjectId layer = Drawing::find(drawing->layerTableId(), name);
    if (name.empty() || layer.isNull()) layer = drawing->clayer();
    (void)entity->setLayer(layer);  // refused only for an entity that is not open for write
}
