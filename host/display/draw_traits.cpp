#include "host/display/draw_traits.h"

void tzhost::DrawTraits::setColor(int index) {
    (void)pen_.color.setColorIndex(index);  // refused, it keeps the colour
}
