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
    // The way from one place to the other, so that a text whose place stays keeps its location to
    // the last bit. A location that is not finite is refused, and the text stays where it is.
    (void)text->setLocation(text->location() + across * (to.across() - from.across()) +
                            down * (to.down() - from.down()));
}
