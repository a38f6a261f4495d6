#pragma once

#include "module/geometry/attachments.h"

// Which point of each text's box is laid on the line, by the names of the keywords. TEXTALIGNMODE
// stores the number, and may hold one that none of these has.
enum class tagTextDirection : int { TL, TC, TR, ML, MC, MR, BL, BC, BR, Left, Center, Right };

// The point of the box. Left and Right take the top corners, Center the middle: the three do not
// share a height. A number outside the table takes the top left corner.
[[nodiscard]] constexpr BoxPlace alignDirToReference(tagTextDirection direction) {
    switch (direction) {
    case tagTextDirection::Left: return {BoxColumn::left, BoxRow::top};
    case tagTextDirection::Center: return {BoxColumn::centre, BoxRow::middle};
    case tagTextDirection::Right: return {BoxColumn::right, BoxRow::top};
    default: return placeOfAttachment(static_cast<int>(direction) + 1);  // in the order of both
    }
}
