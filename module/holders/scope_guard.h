#pragma once

#include <functional>

// Does one thing now and another one on every way out of the block. Either may be empty. `leave`
// must not throw: it runs in the destructor, where an exception ends the process.
//
//   TzScopeGuard const guard([&] { add(handler); }, [&] { remove(handler); });
class [[nodiscard]] TzScopeGuard {
public:
    // When `enter` throws, `leave` is not called.
    TzScopeGuard(std::function<void()> const& enter, std::function<void()> const& leave);
    TzScopeGuard(TzScopeGuard const&) = delete;
    TzScopeGuard& operator=(TzScopeGuard const&) = delete;
    ~TzScopeGuard();

private:
    std::function<void()> leave_;
};
