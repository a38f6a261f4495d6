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

void handOver(Event const& event) {
    sink()(event);
}

EventSink setEventSink(EventSink next) {
    return std::exchange(sink(), std::move(next));
}

}  // namespace tzhost
