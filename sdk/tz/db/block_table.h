#pragma once

#include "tz/db/entity.h"
#include "tz/db/symbol_table.h"
#include "tz/text/array.h"

// The spaces and the block definitions of a database. "*Model_Space" and "*Paper_Space" are always
// there.
class TZ_API TzDbBlockTableRecord : public TzDbSymbolTableRecord {
public:
    TzDbBlockTableRecord();
    [[nodiscard]] TzGePoint3d origin() const;
    Tzad::ErrorStatus setOrigin(TzGePoint3d const& origin);
    // [write-open] Takes an entity over and gives it an id and a handle. The entity then is open
    // for write until its close. On failure it stays the caller's.
    [[nodiscard]] Tzad::ErrorStatus appendTzDbEntity(TzDbObjectId& id, TzDbEntity* entity);
    // [read-open] The entities in drawing order, erased ones left out.
    void entities(TzArray<TzDbObjectId>& ids) const;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

class TZ_API TzDbBlockTable : public TzDbSymbolTable {
public:
    explicit TzDbBlockTable(TzDbObjectImp* imp) : TzDbSymbolTable(imp) {}
    // [read-open] Opens the record of that name.
    [[nodiscard]] Tzad::ErrorStatus
    getAt(wchar_t const* name, TzDbBlockTableRecord*& record, TzDb::OpenMode mode) const;
    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

inline constexpr wchar_t const* kModelSpaceName = L"*Model_Space";
inline constexpr wchar_t const* kPaperSpaceName = L"*Paper_Space";
