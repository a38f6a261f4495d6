#pragma once

#include "tz/db/object_id.h"
#include "tz/rx/status.h"

class TzDbEntity;

// Puts a new entity into model space or paper space of the working drawing.
//
//   TzDbObjectId id;
//   if (postToDb(text, id, paperSpace) != Tzad::eOk) ...   // `text` is gone either way
//
// The entity is taken over: closed when it was added, deleted when it was not. `id` stays as it is
// on failure.
[[nodiscard]] Tzad::ErrorStatus postToDb(TzDbEntity* entity, TzDbObjectId& id, bool paperSpace);
[[nodiscard]] Tzad::ErrorStatus postToDb(TzDbEntity* entity, bool paperSpace);
