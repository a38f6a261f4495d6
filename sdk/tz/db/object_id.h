#pragma once

#include <cstdint>

#include "tz/export.h"

class TzRxClass;
class TzDbDatabase;
class TzDbObject;

// Names an object of a database for as long as the database lives, erased objects included. A plain
// value: copying and comparing never touches the object. The null id names nothing.
//
// The host's older interface names objects by pairs of 64-bit integers; the two operations at the
// end convert.
class TZ_API TzDbObjectId {
public:
    TzDbObjectId() = default;
    explicit TzDbObjectId(struct TzDbObjectRecord* record) : record_(record) {}

    static TzDbObjectId const kNull;

    [[nodiscard]] bool isNull() const { return record_ == nullptr; }
    [[nodiscard]] bool isValid() const { return record_ != nullptr; }
    void setNull() { record_ = nullptr; }
    // [any] The class of the object, null for the null id. Opens nothing.
    [[nodiscard]] TzRxClass* objectClass() const;
    // [any] The database that holds the object, null for the null id.
    [[nodiscard]] TzDbDatabase* database() const;
    // [any] The object's handle, which survives saving; 0 for the null id.
    [[nodiscard]] std::uint64_t handle() const;
    [[nodiscard]] bool isErased() const;
    // [any] Whether the object belongs to the working set; false for the null id.
    [[nodiscard]] bool isInWorkingSet() const;

    // The host's record; only the host looks into it.
    [[nodiscard]] TzDbObjectRecord* record() const { return record_; }

    friend bool operator==(TzDbObjectId a, TzDbObjectId b) { return a.record_ == b.record_; }
    friend bool operator!=(TzDbObjectId a, TzDbObjectId b) { return a.record_ != b.record_; }
    friend bool operator<(TzDbObjectId a, TzDbObjectId b) { return a.record_ < b.record_; }

private:
    TzDbObjectRecord* record_ = nullptr;
};

// [any] The id of the object that an older name means: 0, or a failing status with a null id when
// the name is that of no object.
[[nodiscard]] TZ_API int tzdbGetObjectId(TzDbObjectId& id, long long const* name);
// [any] The older name of an id: 0, or a failing status for the null id.
[[nodiscard]] TZ_API int tzdbGetTzsName(long long* name, TzDbObjectId id);
