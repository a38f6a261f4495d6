#pragma once

#include "tz/export.h"

class TzRxClass;

// Root of every class that the host knows by name. A class tells its descriptor through `desc()`,
// an object that of its own class through `isA()`.
//
//   if (TzDbMText* text = tzrxCast<TzDbMText>(object)) ...
//
// Descriptors live from `newTzRxClass` to `deleteTzRxClass`; those of the host live with the
// process.
class TZ_API TzRxObject {
public:
    virtual ~TzRxObject() = default;

    // [any] The descriptor of the object's own class, never null for a registered class.
    [[nodiscard]] virtual TzRxClass* isA() const;
    // [any] Whether the object's class is `other` or derives from it; null gives false.
    [[nodiscard]] bool isKindOf(TzRxClass const* other) const;
    // [any] The extension object that `other`'s interface has on this object's class or on the
    // nearest of its parents; null when there is none. Owned by the class, valid as long as it is
    // registered.
    [[nodiscard]] TzRxObject* queryX(TzRxClass const* other) const;

    [[nodiscard]] static TzRxClass* desc();

protected:
    TzRxObject() = default;
    TzRxObject(TzRxObject const&) = default;
    TzRxObject& operator=(TzRxObject const&) = default;
};

// The object as a T when its class is T or derives from it; otherwise null. Null gives null.
template <class T>
[[nodiscard]] T* tzrxCast(TzRxObject* object) {
    return object && object->isKindOf(T::desc()) ? static_cast<T*>(object) : nullptr;
}
template <class T>
[[nodiscard]] T const* tzrxCast(TzRxObject const* object) {
    return object && object->isKindOf(T::desc()) ? static_cast<T const*>(object) : nullptr;
}
// The extension of interface T that stands on the object's class; null without an object or
// extension.
template <class T>
[[nodiscard]] T* tzrxQuery(TzRxObject const* object) {
    return object ? static_cast<T*>(object->queryX(T::desc())) : nullptr;
}
