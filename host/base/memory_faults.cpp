#include "host/base/memory_faults.h"

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

bool memoryMayFail() noexcept {
    return scopes > 0 && pauses == 0;
}

}  // namespace tzhost
