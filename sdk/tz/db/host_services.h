#pragma once

#include "tz/export.h"
#include "tz/text/string.h"

class TzDbDatabase;
class TzDbEntity;

// What the host keeps for a document beside its drawing.
class TZ_API TzDbWorkingGlobals {
public:
    virtual ~TzDbWorkingGlobals() = default;
    // [any] Whether the drawing has a working set, and whether only its members may be edited now.
    [[nodiscard]] virtual bool hasWorkingSet() const = 0;
    [[nodiscard]] virtual bool isWorkingSetActive() const = 0;
    // [any] The angle, in radians, by which the place of the working set is turned.
    [[nodiscard]] virtual double workingAngle() const = 0;
};

class TZ_API TzDbHostApplicationServices {
public:
    virtual ~TzDbHostApplicationServices() = default;
    // [any] The drawing that operations without a database work on; null when no drawing is open.
    [[nodiscard]] virtual TzDbDatabase* workingDatabase() const = 0;
    // [any] Null while no drawing is open; tzdbDefaultWorkingGlobals() then serves.
    [[nodiscard]] virtual TzDbWorkingGlobals* workingGlobals() const = 0;
    // [command] An editor is about to open. The host only notes it.
    virtual void textEditorStarting() = 0;
    // [any] The registry key of the product, from the settings; may be empty.
    [[nodiscard]] virtual TzString getProductRegistryKey() const = 0;
};

// [any] Never null, lives with the process.
[[nodiscard]] TZ_API TzDbHostApplicationServices* tzdbHostApplicationServices();
// [any] Globals of no document: no working set, angle 0. Never null.
[[nodiscard]] TZ_API TzDbWorkingGlobals* tzdbDefaultWorkingGlobals();

// Puts new texts on the layer that the drafter keeps for them.
class TZ_API TzTextSetLayer {
public:
    // [write-open] The layer that the variable TEXTLAYER names, the current layer when it is empty
    // or names none.
    static void setTextLayer(TzDbEntity* entity);
};
