#pragma once

#include <ctime>

// The time that goes into what the host makes: date fields, files with a date in them.
namespace tzhost {

// Seconds since 1970, UTC: the value of SOURCE_DATE_EPOCH when that is a whole number, so that the
// same result can be made again; else the time of the clock.
[[nodiscard]] std::time_t resultTime();

}  // namespace tzhost
