#include "module/holders/handle_object.h"

#include <cstdint>

#include "tz/pal/windows_calls.h"

CHandleObject::~CHandleObject() {
    (void)CHandleObject::Close();
}

bool CHandleObject::IsAttached() const {
    return handle != nullptr;
}

bool CHandleObject::Attach(void* newHandle) {
    if (reinterpret_cast<std::uintptr_t>(newHandle) == UINTPTR_MAX) return false;
    handle = newHandle;
    return CHandleObject::IsAttached();
}

bool CHandleObject::operator=(void* newHandle) {
    return Attach(newHandle);
}

void* CHandleObject::Detach() {
    void* const detached = handle;
    handle = nullptr;
    return detached;
}

bool CHandleObject::Close() {
    return CHandleObject::IsAttached() && CloseHandle(CHandleObject::Detach()) != 0;
}

CHandleObject::operator void*() const {
    return handle;
}

void* CHandleObject::Handle() const {
    return handle;
}
