#pragma once

#include <map>
#include <memory>
#include <string>

#include "tz/rx/registry.h"

namespace tzhost {

// The host's dictionary: names in code order, objects owned.
class Dictionary : public TzRxDictionary {
public:
    [[nodiscard]] TzRxObject* at(wchar_t const* name) const override;
    TzRxObject* atPut(wchar_t const* name, TzRxObject* object) override;
    TzRxObject* remove(wchar_t const* name) override;

private:
    std::map<std::wstring, std::unique_ptr<TzRxObject>, std::less<>> objects_;
};

// The dictionary of services in the system registry.
[[nodiscard]] Dictionary& serviceDictionary();

}  // namespace tzhost
