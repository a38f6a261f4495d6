#pragma once

#include "tz/gi/draw.h"

// Lines and text of a preview stand as they are, without the edge effects of the visual style. To
// be called before the preview draws.
void drawPlainEdges(TzGiWorldDraw& draw);
