#pragma once

#include "host/database/object_record.h"
#include "tz/db/object.h"
#include "tz/db/object_id.h"

// Looks into records of the drawing without opening them: drawing a picture is no use of an object
// that others would have to wait for.
namespace tzhost {

// The object with that id when its class is T; null for the null id, an erased object or another
// class. Valid as long as nothing changes the drawing.
template <class T>
[[nodiscard]] T* objectOf(TzDbObjectId id) {
    if (id.isNull() || id.record()->erased) return nullptr;
    return dynamic_cast<T*>(id.record()->object);
}

}  // namespace tzhost
