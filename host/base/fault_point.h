#pragma once

// The one place where a host operation can be made to fail on purpose. Each operation that can fail
// asks here first, under the name that its header declares, and fails when the answer is a fault:
//
//   if (auto const fault = tzhost::faultAt("tzedGetVar")) return *fault;
//
// Which call fails, and how, is decided by whoever installs a hook; without one nothing ever fails.
// Not thread-safe, like the host itself. Never throws.

#include <optional>
#include <string_view>

namespace tzhost {

// The status with which an operation fails unless the plan names another: that of a refused
// question.
constexpr int kUsualFailure = -5001;

// Decides about one call of `operation`: true lets it fail with `status`, which holds the
// operation's usual failure and may be replaced. Called for each asked operation, so it also counts
// the calls.
using FaultHook = bool (*)(std::string_view operation, int& status);

// Installs a hook (null removes it) and returns the one that was there.
FaultHook setFaultHook(FaultHook hook) noexcept;

// The status with which this call must fail, or nothing when it goes on. `usual` is the status of
// the operation's common failure; an operation without a status ignores the number and returns its
// null value.
[[nodiscard]] std::optional<int> faultAt(std::string_view operation, int usual = kUsualFailure);

}  // namespace tzhost
