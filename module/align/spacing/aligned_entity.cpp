#include "module/align/spacing/aligned_entity.h"

#include <array>
#include <numeric>

#include "module/align/spacing/text_box_makers.h"
#include "tz/db/mtext.h"
#include "tz/gi/draw.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/class.h"

TzMTextAlignManipulatorEntity::TzMTextAlignManipulatorEntity(TzDbObjectId id,
                                                             TzGeMatrix3d const& coordSystem)
    : m_id(id), m_coordSystem(coordSystem) {}

TzMTextAlignManipulatorEntity::~TzMTextAlignManipulatorEntity() {
    delete m_clone;
}

void TzMTextAlignManipulatorEntity::prepareForDragging(tagTextDirection direction) {
    cloneDbEntity();
    calculateOriginalBoundingBoxInEcs();
    calculateReferencePointInEcs(direction);
}

void TzMTextAlignManipulatorEntity::cloneDbEntity() {
    if (m_clone) return;
    EasyObject<TzDbEntity> entity;
    if (tzdbOpenObject(entity.object, m_id, TzDb::kForRead) != Tzad::eOk) return;
    m_clone = tzrxCast<TzDbEntity>(static_cast<TzRxObject*>(entity->clone()));
}

void TzMTextAlignManipulatorEntity::calculateOriginalBoundingBoxInEcs() {
    BoundBoxMakerHolder const maker = boundBoxMaker();
    if (!maker) return;
    if (auto const box = maker->makeBoundBox()) {
        m_boundingBox = *box;  // an empty one stands at the plane's origin, and goes from there
        return;
    }
    // A text that cannot be opened is left out.
    delete m_clone;
    m_clone = nullptr;
}

void TzMTextAlignManipulatorEntity::calculateReferencePointInEcs(tagTextDirection direction) {
    TzGePoint3d low;
    TzGePoint3d high;
    m_boundingBox.getMinMaxPoints(low, high);
    std::array<double, 3> const across = {low.x, std::midpoint(low.x, high.x), high.x};
    std::array<double, 3> const down = {high.y, std::midpoint(low.y, high.y), low.y};
    BoxPlace const place = alignDirToReference(direction);
    m_referencePoint.x = across[static_cast<std::size_t>(place.column)];
    m_referencePoint.y = down[static_cast<std::size_t>(place.row)];
}

BoundBoxMakerHolder TzMTextAlignManipulatorEntity::boundBoxMaker() const {
    TzRxClass const* const kind = m_id.objectClass();
    if (kind && kind->isDerivedFrom(TzDbMText::desc()))
        return BoundBoxMakerHolder(new TzMTextAlignBoundBoxMakerMText(m_id, m_coordSystem));
    return BoundBoxMakerHolder(new TzMTextAlignBoundBoxMakerText(m_id, m_coordSystem));
}

BoundBoxMakerHolder TzMTextAlignManipulatorReferenceEntity::boundBoxMaker() const {
    BoundBoxMakerHolder maker = TzMTextAlignManipulatorEntity::boundBoxMaker();
    maker->setViewDirectionForProjection(m_coordSystem.zAxis());
    return maker;
}

void TzMTextAlignManipulatorEntity::move(TzGeVector3d const& offset) {
    if (!m_clone) return;
    TzGeMatrix3d const step = TzGeMatrix3d::translation(offset - m_currentOffset);
    if (m_clone->transformBy(step) == Tzad::eOk) m_currentOffset = offset;
}

void TzMTextAlignManipulatorEntity::replaceDbEntity() {
    if (!m_clone) return;
    EasyObject<TzDbEntity> entity;
    if (tzdbOpenObject(entity.object, m_id, TzDb::kForWrite) != Tzad::eOk) return;
    // When the host refuses the place, the text stays as it is.
    (void)entity->transformBy(TzGeMatrix3d::translation(m_currentOffset));
}

void TzMTextAlignManipulatorEntity::updateAttributes(TzGiCommonDraw& draw) {
    TzRxObject* const traits = &draw.subEntityTraits();
    if (auto* const drawable = tzrxCast<TzGiDrawableTraits>(traits)) setAttributes(drawable);
}

unsigned int TzMTextAlignManipulatorEntity::subSetAttributes(TzGiDrawableTraits* traits) {
    return m_clone ? m_clone->setAttributes(traits) : 0;
}

bool TzMTextAlignManipulatorEntity::subWorldDraw(TzGiWorldDraw* draw) {
    if (!m_clone) return true;
    updateAttributes(*draw);
    m_drawnInWorld = m_clone->worldDraw(draw);
    return m_drawnInWorld;
}

void TzMTextAlignManipulatorEntity::subViewportDraw(TzGiViewportDraw* draw) {
    if (!m_clone || m_drawnInWorld) return;
    updateAttributes(*draw);
    m_clone->viewportDraw(draw);
}
