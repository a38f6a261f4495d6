#include "host/base/fault_point.h"

#include <utility>

namespace tzhost {

namespace {
FaultHook installedHook = nullptr;
}

FaultHook setFaultHook(FaultHook hook) noexcept {
    return std::exchange(installedHook, hook);
}

std::optional<int> faultAt(std::string_view operation, int usual) {
    if (installedHook == nullptr) return std::nullopt;
    int status = usual;
    if (!installedHook(operation, status)) return std::nullopt;
    return status;
}

}  // namespace tzhost
