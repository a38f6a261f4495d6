#pragma once

#include <functional>
#include <nlohmann/json.hpp>

#include "tz/text/string.h"

// What passes between a module and the host, as JSON objects in the order in which it happens. Each
// layer reports its own events; one sink, when there is one, takes them all.
//
//   if (tzhost::eventsWanted()) tzhost::reportEvent({{"event", "write"}, {"handle", "2A"}});
//
// Building an event costs more than asking whether somebody wants it, so ask first.
namespace tzhost {

using Event = nlohmann::ordered_json;
using EventSink = std::function<void(Event const&)>;

[[nodiscard]] bool eventsWanted();
void reportEvent(Event const& event);
// Replaces the sink; an empty one stops events. Returns the sink before.
EventSink setEventSink(EventSink sink);

// Text as events and drawing files hold it: UTF-8.
[[nodiscard]] inline std::string utf8(TzString const& text) {
    return text.toUtf8();
}

}  // namespace tzhost
