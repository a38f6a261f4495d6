#pragma once

#include "module/edit/session_field.h"
#include "tz/db/object_id.h"
#include "tz/text/string.h"

// Fields of a text that is being made, in the working drawing.

// The text with what its fields stand for; a text without fields, or with fields that have no
// value, comes back as it is.
[[nodiscard]] TzString withFieldsEvaluated(TzString const& text);
// Attaches the field that a session left to the text with that id; one that cannot be attached is
// deleted.
void attachField(TzDbObjectId text, SessionField& field);
// Brings the field of the text with that id up to date, when it has one.
void evaluateField(TzDbObjectId text);
