#pragma once

#include "tz/export.h"
#include "tz/rx/object.h"

// Descriptors of runtime classes. A module registers its classes in this order and takes them back
// at unload:
//   1. newTzRxClass for each class
//   2. tzrxBuildClassHierarchy once
//   3. deleteTzRxClass for each class
//
// Owned by the class registry; the pointers are valid until deleteTzRxClass.
class TZ_API TzRxClass : public TzRxObject {
public:
    // [any] The registered name; valid as long as the descriptor.
    [[nodiscard]] virtual wchar_t const* name() const = 0;
    // [any] The parent's descriptor, null for the root and before tzrxBuildClassHierarchy.
    [[nodiscard]] virtual TzRxClass* myParent() const = 0;
    // [any] Whether this is `other` or derives from it; null gives false.
    [[nodiscard]] virtual bool isDerivedFrom(TzRxClass const* other) const = 0;
    // [any] A fresh object of the class, owned by the caller; null for a class without a creator.
    [[nodiscard]] virtual TzRxObject* create() const = 0;
    // [any] Puts an extension object of the interface class `face` on this class, or takes it
    // back. The registry does not own the extension. Returns the extension that stood there before.
    virtual TzRxObject* addX(TzRxClass const* face, TzRxObject* extension) = 0;
    virtual TzRxObject* delX(TzRxClass const* face) = 0;
    // [any] The extension on this very class, or null.
    [[nodiscard]] virtual TzRxObject* getX(TzRxClass const* face) const = 0;
};

using TzRxCreator = TzRxObject* (*)();

// [any] Registers a class and returns its descriptor; null when the name is taken. `parent` is the
// parent's name, resolved by tzrxBuildClassHierarchy; `proxyFlags` is 0; `creator` may be null for
// an abstract class; the names for drawing files and of the application may be null.
[[nodiscard]] TZ_API TzRxClass* newTzRxClass(wchar_t const* name,
                                             wchar_t const* parent,
                                             int proxyFlags,
                                             TzRxCreator creator,
                                             wchar_t const* dxfName,
                                             wchar_t const* appName);
// [any] Removes the class and frees its descriptor; null is ignored.
TZ_API void deleteTzRxClass(TzRxClass* descriptor);
// [any] The descriptor with that name, null when there is none.
[[nodiscard]] TZ_API TzRxClass* tzrxFindTzRxClass(wchar_t const* name);
// [any] Connects newly registered classes with their parents.
TZ_API void tzrxBuildClassHierarchy();
// Ends the process after printing `text` on standard error: a broken promise between modules that
// cannot be mended.
[[noreturn]] TZ_API void tzrx_abort(wchar_t const* text);
