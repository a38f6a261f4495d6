#pragma once

#include "tz/db/mtext.h"
#include "tz/mte/dialog_session.h"
#include "tz/mte/easy_object.h"

// Where the window of the dialog editor stands, in the exported variables that dialogs read:
// gcPoint, gcRect and giPoints in pixels and points, gwysiwyg, g_dMTextObjectHeight, gdx and gdy.

// Over the text as it stands on the screen. gwysiwyg stays set only when the text lies level and
// whole on the desktop and is large enough to be read. Uses the height of the dragged box up.
void CalcEditorSizeAndPosition(EasyObject<TzDbMText>& text);

// Always true: the window never relies on all of the text being seen.
[[nodiscard]] bool PartIsOffScreen();
