#pragma once

#include "tz/db/block_table.h"
#include "tz/db/symbol_table.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"
#include "tz/text/string.h"

// One drawing. Owned by its document.
class TZ_API TzDbDatabase {
public:
    virtual ~TzDbDatabase() = default;

    // [any] The tables, opened; on failure the pointer is null.
    [[nodiscard]] virtual Tzad::ErrorStatus getBlockTable(TzDbBlockTable*& table,
                                                          TzDb::OpenMode mode) = 0;
    [[nodiscard]] virtual Tzad::ErrorStatus getLayerTable(TzDbLayerTable*& table,
                                                          TzDb::OpenMode mode) = 0;
    [[nodiscard]] virtual Tzad::ErrorStatus getLinetypeTable(TzDbLinetypeTable*& table,
                                                             TzDb::OpenMode mode) = 0;
    [[nodiscard]] virtual Tzad::ErrorStatus getTextStyleTable(TzDbTextStyleTable*& table,
                                                              TzDb::OpenMode mode) = 0;

    // [any] The current text style and layer; setters fail for an id of another class.
    [[nodiscard]] virtual TzDbObjectId textstyle() const = 0;
    [[nodiscard]] virtual Tzad::ErrorStatus setTextstyle(TzDbObjectId style) = 0;
    [[nodiscard]] virtual TzDbObjectId clayer() const = 0;
    [[nodiscard]] virtual Tzad::ErrorStatus setClayer(TzDbObjectId layer) = 0;

    // [any] Origins and unit axes of the user systems of model and paper space, world coordinates.
    [[nodiscard]] virtual TzGePoint3d ucsorg() const = 0;
    [[nodiscard]] virtual TzGeVector3d ucsxdir() const = 0;
    [[nodiscard]] virtual TzGeVector3d ucsydir() const = 0;
    [[nodiscard]] virtual TzGePoint3d pucsorg() const = 0;
    [[nodiscard]] virtual TzGeVector3d pucsxdir() const = 0;
    [[nodiscard]] virtual TzGeVector3d pucsydir() const = 0;

    // [any] Whether drags are held on the axes.
    [[nodiscard]] virtual bool orthomode() const = 0;
    virtual Tzad::ErrorStatus setOrthomode(bool on) = 0;

    // [any] The object with a handle; the null id when there is none.
    [[nodiscard]] virtual TzDbObjectId objectAt(std::uint64_t handle) const = 0;
    // [any] The drawing's file, empty while it has none.
    [[nodiscard]] virtual TzString fileName() const = 0;
};
