#pragma once

#include "host/base/event_sink.h"
#include "host/display/draw_list.h"

class TzDbDatabase;
class TzDbEntity;

// One redraw of a drag, as it goes into the events.
//
//   tzhost::reportFrame(jig.entity(), workingDatabase);
namespace tzhost {

// Lets the entity draw itself (null draws nothing) and reports what it drew as the event "frame".
// It is drawn even when nobody wants events, as on any screen.
void reportFrame(TzDbEntity* entity, TzDbDatabase* database);

// The event of a list: lines closed to an outline end where they begin, a colour is an index or
// "#RRGGBB", a line type its name, empty for none.
[[nodiscard]] Event frameEvent(DrawList const& list);

}  // namespace tzhost
