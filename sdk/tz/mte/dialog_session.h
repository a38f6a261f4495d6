#pragma once

#include "tz/export.h"
#include "tz/mte/easy_object.h"

class TzDbMText;

// What a dialog editor may ask of the module while its session runs. The text of the session is
// gpText of tz/mte/globals.h; without a session nothing happens to any text.

// [command] Places the window at a fixed spot in the middle of the application's window: sets
// gcPoint, gcRect, giPoints and gwysiwyg. A text of no height takes that of the box dragged last.
TZ_API void FixedEditorSizeAndPosition(EasyObject<TzDbMText>& text);
// [command] Shows the text again, lets the user pan or zoom, and types the command that opens the
// editor on it once more. `zoomIn` goes on to the host's zoom.
TZ_API void PanZoomMText(bool zoomIn);
// [command] Shows the text of the session again; a message says when it cannot be made writable.
TZ_API void SetVisibility();
