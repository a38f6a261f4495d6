#include "host/entities/new_entity.h"

#include <set>
#include <vector>

#include "host/database/classes.h"
#include "host/database/drawing.h"
#include "host/database/object_list.h"
#include "host/database/symbol_imp.h"
#include "host/entities/shape_imp.h"
#include "host/fields/field_links.h"
#include "tz/db/mtext.h"

namespace tzhost {
namespace {

// The block that a record of a reference draws; null for other entities.
TzDbObjectRecord* blockOf(TzDbObjectRecord const& record) {
    auto const* const insert =
        record.object ? dynamic_cast<InsertImp*>(TzDbObjectAccess::imp(*record.object)) : nullptr;
    return insert ? insert->block.record() : nullptr;
}

// Fills what the entity left open, and says what it may not bring along.
Tzad::ErrorStatus settleIn(Drawing& drawing, TzDbObject const& owner, TzDbEntity& entity) {
    EntityImp& values = valuesOf<EntityImp>(entity);
    auto* const text = dynamic_cast<TextStyledImp*>(&values);
    auto const isForeign = [&](TzDbObjectId id) {
        return !id.isNull() && id.record()->drawing != &drawing;
    };
    auto const* const insert = dynamic_cast<InsertImp const*>(&values);
    if (isForeign(values.layer) || (text && isForeign(text->style)) ||
        (insert && isForeign(insert->block))) {
        return Tzad::eWrongDatabase;
    }
    if (insert && insert->block.isNull()) return Tzad::eNullObjectId;
    if (insert && owner.isKindOf(TzDbBlockTableRecord::desc()) &&
        leadsTo(*insert->block.record(), *owner.objectId().record())) {
        return Tzad::eInvalidInput;
    }
    if (values.layer.isNull()) values.layer = drawing.clayer();
    if (text && text->style.isNull()) text->style = drawing.textstyle();
    return Tzad::eOk;
}

}  // namespace

bool leadsTo(TzDbObjectRecord const& block, TzDbObjectRecord const& inner) {
    std::vector<TzDbObjectRecord const*> open{&block};
    std::set<TzDbObjectRecord const*> seen{&block};
    while (!open.empty()) {
        TzDbObjectRecord const* const each = open.back();
        open.pop_back();
        if (each == &inner) return true;
        for (TzDbObjectRecord const* const entity : listOf(*each)->items) {
            TzDbObjectRecord const* const next = entity->erased ? nullptr : blockOf(*entity);
            if (next && seen.insert(next).second) open.push_back(next);
        }
    }
    return false;
}

Tzad::ErrorStatus appendEntity(TzDbObject& owner, TzDbObjectId& id, TzDbEntity* entity) {
    id.setNull();
    if (!entity) return Tzad::eNullObjectPointer;
    if (entityKind(entity->isA()).isEmpty()) return Tzad::eNotApplicable;
    if (!entity->objectId().isNull()) return Tzad::eAlreadyInDatabase;
    TzDbObjectRecord* const record = owner.objectId().record();
    if (!record) return Tzad::eNoDatabase;
    if (!owner.isWriteEnabled()) return Tzad::eNotOpenForWrite;
    if (auto const status = settleIn(*record->drawing, owner, *entity)) return status;
    TzDbObjectRecord& added = record->drawing->addObject(entity, record, Drawing::Numbered::entity);
    id = TzDbObjectId(&added);
    if (auto* const text = tzrxCast<TzDbMText>(entity)) renewTextField(*text);
    return Tzad::eOk;
}

}  // namespace tzhost
