#include "host/runtime/class_registry.h"
#include "tz/gi/draw.h"

TzRxClass* TzGiDrawable::desc() {
    static TzRxClass* const descriptor = tzhost::hostClass(L"TzGiDrawable", TzRxObject::desc());
    return descriptor;
}

TzRxClass* TzGiDrawable::isA() const {
    return desc();
}

TzRxClass* TzGiSubEntityTraits::desc() {
    static TzRxClass* const descriptor =
        tzhost::hostClass(L"TzGiSubEntityTraits", TzRxObject::desc());
    return descriptor;
}

TzRxClass* TzGiSubEntityTraits::isA() const {
    return desc();
}

TzRxClass* TzGiDrawableTraits::desc() {
    static TzRxClass* const descriptor =
        tzhost::hostClass(L"TzGiDrawableTraits", TzGiSubEntityTraits::desc());
    return descriptor;
}

TzRxClass* TzGiDrawableTraits::isA() const {
    return desc();
}

// The host's visual styles do nothing to edges, so there is nothing to switch off.
void ShareDB::disableVisualStyleEdgeModifiers(TzGiSubEntityTraits& /*traits*/,
                                              TzGiContext* /*context*/,
                                              bool /*jitter*/,
                                              bool /*overhang*/,
                                              bool /*halo*/) {}
