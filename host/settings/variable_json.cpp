#include "host/settings/variable_json.h"

#include <type_traits>

#include "host/text/utf8.h"

namespace tzhost {

nlohmann::ordered_json toJson(VariableValue const& value) {
    return std::visit(
        [](auto const& held) -> nlohmann::ordered_json {
            if constexpr (std::is_same_v<std::decay_t<decltype(held)>, std::wstring>) {
                return toUtf8(held);
            } else {
                return held;
            }
        },
        value);
}

}  // namespace tzhost
