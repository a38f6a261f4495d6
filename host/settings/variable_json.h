#pragma once

// Values of system variables as settings, drawing files and events hold them: numbers, texts in
// UTF-8, and arrays of three numbers.

#include <nlohmann/json.hpp>

#include "host/settings/variable_value.h"

namespace tzhost {

[[nodiscard]] nlohmann::ordered_json toJson(VariableValue const& value);

}  // namespace tzhost
