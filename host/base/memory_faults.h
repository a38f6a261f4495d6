#pragma once

// Memory as a host operation that can fail. The host's library replaces the global `operator new`;
// it asks the fault plan under the name "operator new", but only within a MemoryFaultScope, which
// the run of a command opens, and never within a pause. Otherwise it is malloc.
namespace tzhost {

class MemoryFaultScope {
public:
    MemoryFaultScope() noexcept;
    MemoryFaultScope(MemoryFaultScope const&) = delete;
    MemoryFaultScope& operator=(MemoryFaultScope const&) = delete;
    ~MemoryFaultScope();
};

// Code that gives something back or undoes something runs in a pause: it runs in destructors, also
// while an exception for lack of memory passes.
class MemoryFaultPause {
public:
    MemoryFaultPause() noexcept;
    MemoryFaultPause(MemoryFaultPause const&) = delete;
    MemoryFaultPause& operator=(MemoryFaultPause const&) = delete;
    ~MemoryFaultPause();
};

// Whether an allocation made now asks the fault plan.
[[nodiscard]] bool memoryMayFail() noexcept;

}  // namespace tzhost
