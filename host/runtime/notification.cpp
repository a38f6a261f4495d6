#include "host/runtime/notification.h"

#include "host/base/event_sink.h"

namespace tzhost {

void reportNotification(char const* name) {
    reportEvent([&] { return Event{{"event", "notify"}, {"name", name}}; });
}

}  // namespace tzhost
