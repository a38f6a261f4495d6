#include "tz/pal/settings.h"

#include <algorithm>

#include "host/base/fault_point.h"
#include "host/files/ini_data.h"
#include "host/settings/settings.h"
#include "tz/text/string.h"

namespace {

using Values = std::map<std::wstring, std::uint32_t>;

class ProductValues : public Tzworks::Tzdraft::PAL::Settings::Container {
public:
    explicit ProductValues(Values values) : values_(std::move(values)) {}
    [[nodiscard]] bool exists(wchar_t const* key) const override {
        return values_.count(tzhost::lowered(key)) != 0;
    }
    [[nodiscard]] std::uint32_t getUInt32(wchar_t const* key) const override {
        auto const at = values_.find(tzhost::lowered(key));
        return at == values_.end() ? 0 : at->second;
    }

private:
    Values values_;
};

}  // namespace

namespace Tzworks::Tzdraft::PAL {

Settings::Roots Settings::read() {
    return {};
}

TzString Settings::productRegistryKey() {
    return tzhost::settings().productKey;
}

bool Settings::Roots::getProductSettings(wchar_t const* name,
                                         Reader const& reader,
                                         bool userValues) const {
    if (tzhost::faultAt("Settings::Roots::getProductSettings") || name == nullptr) return false;
    auto const& products = tzhost::settings().product;
    auto const at = products.find(tzhost::lowered(name));
    return reader(ProductValues(userValues && at != products.end() ? at->second : Values()));
}

bool Process::isFabric() {
    return tzhost::settings().fabric;
}

}  // namespace Tzworks::Tzdraft::PAL

bool IsCommandAllowed(wchar_t const* encodedName) {
    if (tzhost::faultAt("IsCommandAllowed") || encodedName == nullptr) return false;
    std::wstring name(encodedName);
    for (wchar_t& c : name)
        --c;
    auto const& denied = tzhost::settings().denied;
    return std::none_of(denied.begin(), denied.end(), [&name](std::wstring const& each) {
        return tzCompareNoCase(each.c_str(), name.c_str()) == 0;
    });
}
