#pragma once

#include "tz/db/object_id.h"
#include "tz/mte/easy_object.h"
#include "tz/text/string.h"

class TzDbTextStyleTableRecord;

// Text styles of the working drawing: names and ids, the height that a style gives, annotative and
// vertical styles. Nothing here fails loudly; a style that cannot be opened gives the answer
// stated.

// A style's name; null when the style cannot be opened. The text is the host's: copy it at once.
[[nodiscard]] wchar_t const* GetTextStyleName(TzDbObjectId const& style);
// The name of the style in force.
[[nodiscard]] wchar_t const* GetCurrentTextStyleName();
// The style with that name, as the drawing's table compares names; the null id when there is none.
[[nodiscard]] TzDbObjectId GetTextStyleID(TzString const& name);
// The same two questions with a status. On false, `name` stays as it is and `style` is null.
[[nodiscard]] bool GetTextStyleNameFromID(TzDbObjectId const& style, TzString& name);
[[nodiscard]] bool GetIDFromTextStyleName(TzString const& name, TzDbObjectId& style);

// Whether the object's size follows the annotation scale; false when it cannot be opened or has no
// such property.
[[nodiscard]] bool StyleIsAnnotative(TzDbObjectId style);

// The names of styles that belong to an external reference hold this; they cannot be chosen.
inline constexpr wchar_t kExternalStyleMark = L'|';

// How many drawing units one unit of an annotative text's own height is: the variable
// CANNOSCALEVALUE.
[[nodiscard]] double annotationScale();

// The text height to begin with, in drawing units: the style's own, over the annotation scale for
// an annotative style; for a style of variable height TEXTSIZE; 0.2 when neither gives one.
[[nodiscard]] double ComputeTextSize(TzDbObjectId style);
// The same for the style in force.
[[nodiscard]] double ComputeTextSize();

// Whether a style writes vertically with a typeface made for that, whose name begins with "@".
// False without a record.
[[nodiscard]] bool IsVerticalTTF(EasyObject<TzDbTextStyleTableRecord>& record);
// The same for the style in force.
[[nodiscard]] bool IsVerticalTTF();
