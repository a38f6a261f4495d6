#pragma once

// What a module tells the host and needs no answer to: it becomes an event and nothing else.
namespace tzhost {

// Reports the event "notify" with this name.
void reportNotification(char const* name);

}  // namespace tzhost
