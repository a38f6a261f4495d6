#include "module/align/spacing/text_axes.h"

#include "tz/ge/arbitrary_axis.h"

TzGeMatrix3d
calculateObjEcs(TzGePoint3d const& position, TzGeVector3d const& normal, double rotation) {
    TzGeMatrix3d const axes = atwt(normal);
    return TzGeMatrix3d::translation(position.asVector()) *
           TzGeMatrix3d::rotation(rotation, axes.zAxis()) * axes;
}
