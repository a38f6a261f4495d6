#pragma once

#include "tz/db/mtext.h"

// The direction of a keyword: top to bottom, or left to right for any other id. Nothing calls it:
// no question asks for the direction, which follows the text style.
[[nodiscard]] TzDbMText::FlowDirection MapDirection(unsigned int id);
