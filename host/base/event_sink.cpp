#include "host/base/event_sink.h"

#include <utility>

namespace tzhost {
namespace {

EventSink& sink() {
    static EventSink theSink;
    return theSink;
}

}  // namespace

bool eventsWanted() {
    return static_cast<bool>(sink());
}

void reportEvent(Event const& event) {
    if (sink()) sink()(event);
}

EventSink setEventSink(EventSink next) {
    return std::exchange(sink(), std::move(next));
}

}  // namespace tzhost
