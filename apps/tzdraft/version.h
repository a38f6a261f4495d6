#pragma once

namespace tzdraft {

inline constexpr char kVersion[] = "tzdraft 1.0";

}  // namespace tzdraft
