#pragma once

#include <ctime>

// The time that goes into what the host makes: date fields, files with a date in them.
namespace tzhost {

// Seconds since 1970, UTC: those of SOURCE_DATE_EPOCH when that is set to a whole number, so that a
// result can be made again, else the clock's.
[[nodiscard]] std::time_t resultTime();

}  // namespace tzhost
