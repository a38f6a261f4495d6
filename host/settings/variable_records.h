#pragma once

// Values of system variables as the records of tz/rx/resbuf.h.

#include <optional>

#include "host/settings/variable_value.h"
#include "tz/rx/resbuf.h"

namespace tzhost {

// Writes type and value into `record`; a text is a copy that the record's owner releases.
void toRecord(VariableValue const& value, resbuf& record);

// The value of a record; nothing when its type is none that a variable may have.
[[nodiscard]] std::optional<VariableValue> fromRecord(resbuf const& record);

}  // namespace tzhost
