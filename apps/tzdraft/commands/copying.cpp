#include "apps/tzdraft/commands/copying.h"

#include "apps/tzdraft/commands/record.h"
#include "tz/db/field.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"

namespace tzdraft {
namespace {

// An entity on its way into a block, which a failure on the way deletes.
using Copy = std::unique_ptr<TzDbEntity>;

Copy cloned(TzDbEntity const& entity) {
    return Copy(static_cast<TzDbEntity*>(entity.clone()));
}

// A reference without its attributes, which each reference has of its own.
Copy withoutAttributes(TzDbBlockReference const& reference) {
    auto copy = std::make_unique<TzDbBlockReference>();
    // The values are those of an entity and so are taken.
    (void)copy->setLayer(reference.layerId());
    (void)copy->setColor(reference.color());
    (void)copy->setVisibility(reference.visibility());
    (void)copy->setBlockTableRecord(reference.blockTableRecord());
    (void)copy->setPosition(reference.position());
    (void)copy->setNormal(reference.normal());
    (void)copy->setRotation(reference.rotation());
    (void)copy->setScale(reference.scale());
    return copy;
}

// A copy has the text of the original alone; the code that the text comes from goes with it too.
void copyField(TzDbEntity const& from, TzDbEntity& to) {
    TzDbField* found = nullptr;
    if (from.getField(L"TEXT", found, TzDb::kForRead) != Tzad::eOk) return;
    Opened<TzDbField> const original(found);
    auto copy = std::make_unique<TzDbField>();
    TzDbObjectId id;
    if (copy->setFieldCode(original->getFieldCode(0), 0, nullptr) != Tzad::eOk) return;
    if (to.setField(L"TEXT", copy.get(), id) == Tzad::eOk) (void)copy.release()->close();
}

void copyAttributes(TzDbBlockReference const& from,
                    TzDbBlockReference& to,
                    TzGeMatrix3d const& placed) {
    TzArray<TzDbObjectId> ids;
    from.attributes(ids);
    for (int index = 0; index < ids.length(); ++index) {
        Opened<TzDbAttribute> const attribute(ids[index], TzDb::kForRead);
        if (!attribute) continue;
        Copy copy = cloned(*attribute.get());
        TzDbObjectId id;
        if (!copy || copy->transformBy(placed) != Tzad::eOk) continue;
        if (to.appendAttribute(id, static_cast<TzDbAttribute*>(copy.get())) != Tzad::eOk) continue;
        Opened<TzDbEntity> const added(copy.release());
        copyField(*attribute.get(), *added.get());
    }
}

}  // namespace

bool copyInto(TzDbBlockTableRecord& block, TzDbEntity const& entity, TzGeMatrix3d const& placed) {
    auto const* const reference =
        tzrxCast<TzDbBlockReference>(static_cast<TzRxObject const*>(&entity));
    Copy copy = reference ? withoutAttributes(*reference) : cloned(entity);
    TzDbObjectId id;
    if (!copy || copy->transformBy(placed) != Tzad::eOk) return false;
    if (block.appendTzDbEntity(id, copy.get()) != Tzad::eOk) return false;
    Opened<TzDbEntity> const added(copy.release());
    copyField(entity, *added.get());
    if (reference)
        copyAttributes(*reference, static_cast<TzDbBlockReference&>(*added.get()), placed);
    return true;
}

}  // namespace tzdraft
