#pragma once

#include <functional>
#include <nlohmann/json.hpp>

#include "host/base/memory_faults.h"
#include "tz/text/string.h"

// What passes between a module and the host, as JSON objects in the order in which it happens. Each
// layer reports its own events; one sink, when there is one, takes them all.
//
//   tzhost::reportEvent([&] { return tzhost::Event{{"event", "write"}, {"handle", "2A"}}; });
//
// An event is built only when there is a sink. No allocation is made to fail meanwhile: the event
// must be reported in any case, and the JSON library cannot hand such a failure up.
namespace tzhost {

using Event = nlohmann::ordered_json;
using EventSink = std::function<void(Event const&)>;

[[nodiscard]] bool eventsWanted();
// Hands an event to the sink, which must be there.
void handOver(Event const& event);
// Reports what `build` returns.
template <class Build>
void reportEvent(Build const& build) {
    if (!eventsWanted()) return;
    MemoryFaultPause const pause;
    handOver(build());
}
// Replaces the sink; an empty one stops events. Returns the previous sink.
EventSink setEventSink(EventSink sink);

// Text as events and drawing files hold it: UTF-8.
[[nodiscard]] inline std::string utf8(TzString const& text) {
    return text.toUtf8();
}

}  // namespace tzhost
