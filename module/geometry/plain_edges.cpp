#include "module/geometry/plain_edges.h"

void drawPlainEdges(TzGiWorldDraw& draw) {
    ShareDB::disableVisualStyleEdgeModifiers(draw.subEntityTraits(), draw.context(), true, true,
                                             false);
}
