#pragma once

#include "tz/db/mtext.h"
#include "tz/ed/editors.h"

// What the module tells the in-place editor about one session.

struct InPlaceOptions {
    bool view = false;
    bool attribute = false;  // the text of an attribute, for which ATTIPE decides how it is edited
    bool option13 = false;   // bits of the options word
    bool option14 = false;
};

// The record for a session on `text`. The height of a box dragged before counts for a text that is
// in no drawing yet. Pixel sizes are those of the product settings "MTEXT.IPE", where they are
// given.
[[nodiscard]] IPESettings inPlaceSettings(TzDbMText const& text, InPlaceOptions const& options);
