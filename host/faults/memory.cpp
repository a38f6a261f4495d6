#include "host/base/memory_faults.h"

#include <cstdlib>
#include <new>

#include "host/base/fault_point.h"

namespace tzhost {
namespace {

void* allocate(std::size_t size) {
    if (memoryMayFail()) {
        MemoryFaultPause const pause;
        if (faultAt("operator new")) throw std::bad_alloc();
    }
    if (void* const memory = std::malloc(size > 0 ? size : 1)) return memory;
    throw std::bad_alloc();
}

}  // namespace
}  // namespace tzhost

void* operator new(std::size_t size) {
    return tzhost::allocate(size);
}
void* operator new[](std::size_t size) {
    return tzhost::allocate(size);
}
void operator delete(void* memory) noexcept {
    std::free(memory);
}
void operator delete[](void* memory) noexcept {
    std::free(memory);
}
void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}
void operator delete[](void* memory, std::size_t) noexcept {
    std::free(memory);
}
