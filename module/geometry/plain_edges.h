#pragma once

#include "tz/gi/draw.h"

// Makes the host draw the lines and texts of a preview without the edge effects of the visual
// style. Call it before the preview draws.
void drawPlainEdges(TzGiWorldDraw& draw);
