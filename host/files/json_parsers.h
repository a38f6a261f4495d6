#pragma once

#include "host/files/json_events.h"

namespace tzhost {

// Parses the source and hands its events over; false when they stopped it or something is wrong,
// which they are then told.
//
// A fast parser reads as far as it can. What it takes for wrong a second one looks at, which reads
// from the start, leaves out the events that were handed over, and has the last word with its
// sentences. The two never differ: the first one's events are those of the second, and it takes
// nothing that the second refuses.
[[nodiscard]] bool parseJson(JsonSource& source, JsonEvents& events);

}  // namespace tzhost
