#include "module/edit/attachment.h"

#include "module/geometry/attachments.h"

void UpdateAttachPoint(EasyObject<TzDbMText>& text,
                       TzDbMText::AttachmentPoint newPoint,
                       double height) {
    double width = text->width();
    if (height == kMeasureHeight) height = text->actualHeight(nullptr);
    if (width == 0) width = text->actualWidth();

    TzGeVector3d const direction = text->direction();
    TzGeVector3d const across = direction * width;
    TzGeVector3d const down = direction.crossProduct(text->normal()) * height;
    BoxPlace const from = placeOfAttachment(text->attachment());
    BoxPlace const to = placeOfAttachment(newPoint);
    TzGePoint3d const topLeft = text->location() - across * from.across() - down * from.down();
    // A place that is not finite is refused, and the text stays where it is.
    (void)text->setLocation(topLeft + across * to.across() + down * to.down());
}
