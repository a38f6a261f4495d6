#pragma once

#include <cstdint>
#include <functional>

#include "tz/export.h"
#include "tz/text/string.h"

// What the user has set for the host's products, and what kind of process this is.
//
//   using namespace Tzworks::Tzdraft::PAL;
//   Settings::read().getProductSettings(
//       L"MTEXT.IPE",
//       [&](Settings::Container const& values) {
//           if (values.exists(L"MinPixelSize")) size = values.getUInt32(L"MinPixelSize");
//           return true;
//       },
//       true);
//
// [any]
namespace Tzworks::Tzdraft::PAL {

namespace Settings {

// The values under one name. Valid while the reader runs.
class TZ_API Container {
public:
    virtual ~Container() = default;
    [[nodiscard]] virtual bool exists(wchar_t const* key) const = 0;
    // 0 for a key that does not exist.
    [[nodiscard]] virtual std::uint32_t getUInt32(wchar_t const* key) const = 0;
};

// The settings as they were when they were read.
class TZ_API Roots {
public:
    using Reader = std::function<bool(Container const& values)>;

    // Calls `reader` once with the values that the user has set under that name; there may be none.
    // With `userValues` false only the product's own values count, and this host has none. Returns
    // what `reader` returned, or false when the settings could not be read.
    bool getProductSettings(wchar_t const* name, Reader const& reader, bool userValues) const;
};

[[nodiscard]] TZ_API Roots read();

// The registry key of the product, which the settings give; may be empty.
[[nodiscard]] TZ_API TzString productRegistryKey();

}  // namespace Settings

namespace Process {

// Whether the host runs as a service without a window of its own, where only the in-place editor
// may be used.
[[nodiscard]] TZ_API bool isFabric();

}  // namespace Process

}  // namespace Tzworks::Tzdraft::PAL

// Whether the product may offer a feature. `encodedName` is the feature's name with each character
// code raised by one.
[[nodiscard]] TZ_API bool IsCommandAllowed(wchar_t const* encodedName);
