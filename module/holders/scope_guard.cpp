#include "module/holders/scope_guard.h"

TzScopeGuard::TzScopeGuard(std::function<void()> const& enter, std::function<void()> const& leave)
    : leave_(leave) {
    if (enter) enter();
}

TzScopeGuard::~TzScopeGuard() {
    if (leave_) leave_();
}
