#include "tz/pal/registry.h"

#include <algorithm>

#include "host/base/fault_point.h"
#include "host/files/ini_data.h"
#include "host/settings/settings.h"

namespace {

using Values = std::vector<std::pair<std::wstring, tzhost::RegistryValue>>;

std::wstring rootName(HKEY root) {
    switch (root) {
    case HKEY_CURRENT_USER: return L"hkey_current_user";
    case HKEY_LOCAL_MACHINE: return L"hkey_local_machine";
    }
    return {};
}

// A key with values, or one above such a key. The roots are always there.
bool isKey(std::wstring const& key) {
    auto const& keys = tzhost::settings().registry;
    if (keys.count(key) != 0 || key.find(L'\\') == key.npos) return true;
    std::wstring const below = key + L'\\';
    auto const at = keys.lower_bound(below);
    return at != keys.end() && at->first.compare(0, below.size(), below) == 0;
}

Values const& valuesOf(TzString const& key) {
    static Values const none;
    auto const& keys = tzhost::settings().registry;
    auto const at = keys.find(key.str());
    return at == keys.end() ? none : at->second;
}

tzhost::RegistryValue const* find(TzString const& key, wchar_t const* name) {
    Values const& values = valuesOf(key);
    auto const at = std::find_if(values.begin(), values.end(), [name](auto const& each) {
        return tzCompareNoCase(each.first.c_str(), name) == 0;
    });
    return at == values.end() ? nullptr : &at->second;
}

std::uint32_t typeOfValue(tzhost::RegistryValue const& value) {
    return std::holds_alternative<std::wstring>(value) ? REG_SZ : REG_DWORD;
}

}  // namespace

bool CTwUiRegistryAccess::Open(HKEY root, wchar_t const* path) {
    Close();
    if (tzhost::faultAt("CTwUiRegistryAccess::Open")) return false;
    std::wstring key = rootName(root);
    if (key.empty()) return false;
    if (path != nullptr && *path != 0) key += L'\\' + tzhost::lowered(path);
    while (key.back() == L'\\')
        key.pop_back();
    if (!isKey(key)) return false;
    key_ = TzString(std::move(key));
    isOpen_ = true;
    return true;
}

void CTwUiRegistryAccess::Close() {
    key_.setEmpty();
    isOpen_ = false;
}

TzString CTwUiRegistryAccess::GetString(wchar_t const* name) const {
    tzhost::RegistryValue const* const value = find(key_, name);
    std::wstring const* const text = value ? std::get_if<std::wstring>(value) : nullptr;
    return text ? TzString(*text) : TzString();
}

bool CTwUiRegistryAccess::GetDword(wchar_t const* name,
                                   std::uint32_t& value,
                                   std::uint32_t& type) const {
    tzhost::RegistryValue const* const found = find(key_, name);
    if (found == nullptr) return false;
    type = typeOfValue(*found);
    if (type == REG_DWORD) value = std::get<std::uint32_t>(*found);
    return true;
}

bool CTwUiRegistryAccess::EnumValueNames(int index, TzString& name, std::uint32_t& type) const {
    Values const& values = valuesOf(key_);
    if (index < 0 || static_cast<std::size_t>(index) >= values.size()) return false;
    auto const& [valueName, value] = values[static_cast<std::size_t>(index)];
    name = TzString(valueName);
    type = typeOfValue(value);
    return true;
}
