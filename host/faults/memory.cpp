#include "host/faults/memory.h"

#include <cstdlib>
#include <new>

#include "host/base/fault_point.h"

namespace tzhost {
namespace {

// The host has one thread; these are per thread so that threads of libraries never meet a fault.
thread_local int scopes = 0;
thread_local int pauses = 0;

}  // namespace

MemoryFaultScope::MemoryFaultScope() noexcept {
    ++scopes;
}
MemoryFaultScope::~MemoryFaultScope() {
    --scopes;
}
MemoryFaultPause::MemoryFaultPause() noexcept {
    ++pauses;
}
MemoryFaultPause::~MemoryFaultPause() {
    --pauses;
}

namespace {

void* allocate(std::size_t size) {
    if (scopes > 0 && pauses == 0) {
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
