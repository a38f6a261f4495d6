#pragma once

#include "tz/ed/editors.h"

// What the events tell about sessions of editors.
namespace tzhost {

// Reports the end of a session. `kind` names the editor as docs/events.md lists them; `settings` is
// the record of the in-place editor, null for every other one.
void reportEditor(char const* kind, bool accepted, IPESettings const* settings);

}  // namespace tzhost
