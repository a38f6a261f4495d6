#pragma once

#include "tz/export.h"
#include "tz/rx/object.h"

// The host's registry of named objects. It holds
//   "DynamicLinker"             a TzRxDynamicLinker
//   "ServiceDictionary"         a TzRxDictionary with the services of loaded modules
//   "TZAD_REGISTERED_COMMANDS"  the TzEdCommandStack of tz/ed/command_stack.h
class TZ_API TzRxDictionary : public TzRxObject {
public:
    // [any] The object under that name, null when there is none. The dictionary keeps it.
    [[nodiscard]] virtual TzRxObject* at(wchar_t const* name) const = 0;
    // [any] Puts an object under a name; returns the object that stood there, which the caller then
    // owns, or null. The dictionary deletes what it still holds when the process ends.
    virtual TzRxObject* atPut(wchar_t const* name, TzRxObject* object) = 0;
    // [any] Takes the object out and hands it to the caller; null when there is none.
    virtual TzRxObject* remove(wchar_t const* name) = 0;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

// Loads and unloads modules. A module calls the two operations when it is loaded, in this order.
class TZ_API TzRxDynamicLinker : public TzRxObject {
public:
    // [message 1] The module with that handle may be unloaded again. False for an unknown handle.
    virtual bool allowUnload(void* appHandle) = 0;
    // [message 1] The module serves several drawings at a time. False for an unknown handle.
    virtual bool declareMultiDocument(void* appHandle) = 0;

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;
};

// [any] The registry; never null, lives with the process.
[[nodiscard]] TZ_API TzRxDictionary* tzrxSysRegistry();
// [any] Puts a service object under `name` into "ServiceDictionary" and returns it; the dictionary
// owns the object until it is removed, and whoever removes the object deletes it. A name that is
// already there keeps its object.
TZ_API TzRxObject* tzrxRegisterService(wchar_t const* name);
