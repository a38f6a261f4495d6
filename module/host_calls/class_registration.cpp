#include "module/host_calls/class_registration.h"

TzRxClass* registerRuntimeClass(TzRxClass*& descriptor,
                                wchar_t const* name,
                                wchar_t const* parent,
                                TzRxCreator creator) {
    if (descriptor) {
        TzRxClass* const registered = tzrxFindTzRxClass(name);
        if (registered == descriptor) return descriptor;
        if (registered) tzrx_abort(L"Class mismatch");
    }
    descriptor = newTzRxClass(name, parent, 0, creator, nullptr, nullptr);
    return descriptor;
}

void unregisterRuntimeClass(TzRxClass*& descriptor) {
    deleteTzRxClass(descriptor);
    descriptor = nullptr;
}
