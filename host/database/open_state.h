#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

#include "tz/db/object.h"
#include "tz/text/string.h"

struct TzDbObjectRecord;

// Openings of objects: the rules of who may open what, counted in the audit.
namespace tzhost {

// The record whose openings count for an object: its own, or that of the object it is a part of;
// null for an object in no drawing.
[[nodiscard]] TzDbObjectRecord* openRecordOf(TzDbObject const& object);

// Whether the layer of the record's entity is locked.
[[nodiscard]] bool isOnLockedLayer(TzDbObjectRecord const& record);

// Opens or refuses; openings for notification are those for read.
[[nodiscard]] Tzad::ErrorStatus openRecord(TzDbObjectRecord& record, TzDb::OpenMode mode);
// Counts the opening for write that a new object is born with.
void openNew(TzDbObjectRecord& record) noexcept;
// Gives back every opening of a record whose drawing goes away.
void dropOpenings(TzDbObjectRecord& record) noexcept;

// Opens a record for write for the host's own sake, whatever its openings are, and puts them back.
class HostOpening {
public:
    explicit HostOpening(TzDbObjectRecord& record);
    HostOpening(HostOpening const&) = delete;
    HostOpening& operator=(HostOpening const&) = delete;
    ~HostOpening();

private:
    TzDbObjectRecord& record_;
    bool wasWriter_;
};

// A handle as drawings and scripts write it: hexadecimal capitals without a prefix.
[[nodiscard]] TzString handleText(std::uint64_t handle);
// Reads a handle of an entity, in small letters too; nothing for any other text.
[[nodiscard]] std::optional<std::uint64_t> readHandle(std::string_view text);

}  // namespace tzhost
