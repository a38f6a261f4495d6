#include "tz/db/symbol_utilities.h"

#include "tz/text/string.h"

namespace tzhost {
namespace {

class SymbolUtilityServices : public TzDbSymbolUtilityServices {
public:
    [[nodiscard]] int compareSymbolName(wchar_t const* first,
                                        wchar_t const* second) const override {
        return tzCompareNoCase(first, second);
    }
};

}  // namespace
}  // namespace tzhost

TzDbSymbolUtilityServices const* TzDbSymbolUtilities::servicesPtr() {
    static tzhost::SymbolUtilityServices const services;
    return &services;
}
