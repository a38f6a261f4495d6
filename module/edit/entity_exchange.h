#pragma once

#include "tz/db/mtext.h"
#include "tz/mte/easy_object.h"
#include "tz/mte/editor_interface.h"

// What of a text the dialog editor gets and gives back: its contents with the codes of its fields,
// and everything that the dialog may change.

// The colour of the text's layer, 0x00BBGGRR; white when the layer cannot be opened.
[[nodiscard]] unsigned int GetObjectByLayerColor(EasyObject<TzDbMText>& text);

// Fills an editor from a text, whose height becomes the working text size.
void feedEditor(CMTextEditorInterface& editor, EasyObject<TzDbMText>& text);
// The contents for the editor: with the codes of the field, when there is one. False, and
// `contents` stays as it is, when there is a field that cannot be opened.
[[nodiscard]] bool contentsForEditor(TzDbMText const& text, CStdStrW& contents);

// Writes everything back to a text that is open for write. The colour is written when it is no
// longer `fedColor`. A text with fields gets them as a field: its own in a drawing, else one that
// is left in the holder, beside the codes in the contents.
void takeFromEditor(CMTextEditorInterface& editor,
                    EasyObject<TzDbMText>& text,
                    unsigned int fedColor);
