#pragma once

#include <optional>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/placing.h"
#include "tz/db/text.h"

// What the commands that make single-line texts have in common.
namespace tzdraft {

// World coordinates; the rotation as entities count it.
struct TextPlace {
    TzGePoint3d point;  // what the justification says lies there
    TzGeVector3d normal;
    double rotation = 0;
    double height = 0;
    TzDbText::Justification justification = TzDbText::kLeft;
};

// Whether the text can be justified by a keyword at the start point.
enum class Justified { no, yes };

// Asks for start point, height (unless the style has one) and angle; nothing after a cancel.
[[nodiscard]] std::optional<TextPlace> askTextPlace(Justified justified);

// Puts a new text there, on the layer for texts, with the proportions of its style; its height is
// the one that the next text proposes.
void placeText(TzDbText& text, TextPlace const& place);

}  // namespace tzdraft
