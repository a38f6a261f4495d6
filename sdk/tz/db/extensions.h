#pragma once

#include "tz/db/object.h"

// What the host can do with objects of a class beyond the class itself; found with tzrxQuery. Text
// styles and texts have both.

// Objects whose size follows the annotation scale.
class TZ_API TzDbAnnotativeObjectPE : public TzRxObject {
public:
    // [any] False also for null.
    [[nodiscard]] virtual bool annotative(TzDbObject const* object) = 0;
    // [write-open]
    virtual Tzad::ErrorStatus setAnnotative(TzDbObject* object, bool annotative) = 0;
    // [write-open] Brings the object's annotation scale up to date and says whether that changed
    // it; it may do nothing.
    virtual Tzad::ErrorStatus updateScale(TzDbObject* object, bool& changed) = 0;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

// Objects that keep upright on the sheet.
class TZ_API TzDbPaperOrientationPE : public TzRxObject {
public:
    // [any] False also for null.
    [[nodiscard]] virtual bool paperOrientation(TzDbObject const* object) = 0;
    // [write-open]
    virtual Tzad::ErrorStatus setPaperOrientation(TzDbObject* object, bool oriented) = 0;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};
