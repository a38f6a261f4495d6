#include "host/selection/entity_list.h"

#include <algorithm>
#include <utility>

#include "host/database/drawing.h"
#include "host/database/object_list.h"
#include "host/display/record_access.h"
#include "host/display/shown.h"
#include "tz/db/entity.h"
#include "tz/db/symbol_table.h"

namespace tzhost {

namespace {

KeptEntities& implied() {
    static KeptEntities entities;
    return entities;
}

KeptEntities& previous() {
    static KeptEntities entities;
    return entities;
}

void appendEntities(EntityIds& ids, TzDbObjectId space) {
    ObjectList const* const list = listOf(*space.record());
    if (list == nullptr) return;
    for (TzDbObjectRecord* const record : list->items) {
        if (!record->erased) ids.append(TzDbObjectId(record));
    }
}

// Null while no drawing is open.
ObjectList const* listOfActiveSpace() {
    Drawing const* const drawing = workingDrawing();
    return drawing != nullptr ? listOf(*drawing->activeSpace().record()) : nullptr;
}

bool isSelectable(TzDbObjectRecord* record) {
    TzDbEntity const* const entity = entityOf(TzDbObjectId(record));
    return entity != nullptr && !isOnLayerOff(*entity);
}

}  // namespace

KeptEntities::KeptEntities(EntityIds ids) : ids_(std::move(ids)) {
    Drawing const* const drawing = workingDrawing();
    drawing_ = drawing != nullptr ? drawing->serial() : 0;
}

EntityIds KeptEntities::read() const {
    EntityIds alive;
    Drawing const* const drawing = workingDrawing();
    if (drawing == nullptr || drawing->serial() != drawing_) return alive;
    for (TzDbObjectId const id : ids_) {
        if (!id.isErased()) alive.append(id);
    }
    return alive;
}

EntityIds entitiesOfActiveSpace() {
    EntityIds ids;
    if (ObjectList const* const list = listOfActiveSpace()) {
        for (TzDbObjectRecord* const record : list->items) {
            if (isSelectable(record)) ids.append(TzDbObjectId(record));
        }
    }
    return ids;
}

EntityIds newestEntity() {
    EntityIds newest;
    ObjectList const* const list = listOfActiveSpace();
    if (list == nullptr) return newest;
    auto const at = std::find_if(list->items.rbegin(), list->items.rend(), isSelectable);
    if (at != list->items.rend()) newest.append(TzDbObjectId(*at));
    return newest;
}

EntityIds entitiesOfAllSpaces() {
    EntityIds ids;
    if (Drawing const* const drawing = workingDrawing()) {
        appendEntities(ids, drawing->modelSpace());
        appendEntities(ids, drawing->paperSpace());
    }
    return ids;
}

bool isInActiveSpace(TzDbObjectId id) {
    Drawing const* const drawing = workingDrawing();
    return drawing != nullptr && entityOf(id) != nullptr &&
           id.record()->owner == drawing->activeSpace().record();
}

TzDbEntity* entityOf(TzDbObjectId id) {
    return objectOf<TzDbEntity>(id);
}

bool isOnLockedLayer(TzDbObjectId id) {
    TzDbEntity const* const entity = entityOf(id);
    auto const* const layer = entity ? objectOf<TzDbLayerTableRecord>(entity->layerId()) : nullptr;
    return layer != nullptr && layer->isLocked();
}

void setImpliedSelection(EntityIds ids) {
    implied() = KeptEntities(std::move(ids));
}

void dropImpliedSelection() {
    implied() = {};
}

EntityIds impliedSelection() {
    return implied().read();
}

void setPreviousSelection(EntityIds ids) {
    previous() = KeptEntities(std::move(ids));
}

EntityIds previousSelection() {
    return previous().read();
}

}  // namespace tzhost
