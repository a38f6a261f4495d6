#include "module/edit/attachment.h"

#include <array>

namespace {

// How far a point of the box stands from its top left corner, in widths and, down the page,
// heights.
struct BoxFactors {
    double width;
    double height;
};

BoxFactors factorsOf(TzDbMText::AttachmentPoint point) {
    // In the order of the attachment points, from 1.
    static constexpr std::array<BoxFactors, 9> kFactors{
        {
         {0.0, 0.0},
         {0.5, 0.0},
         {1.0, 0.0},
         {0.0, 0.5},
         {0.5, 0.5},
         {1.0, 0.5},
         {0.0, 1.0},
         {0.5, 1.0},
         {1.0, 1.0},
         }
    };
    bool const known = point >= TzDbMText::kTopLeft && point <= TzDbMText::kBottomRight;
    return kFactors[known ? static_cast<std::size_t>(point - 1) : 0];
}

}  // namespace

void UpdateAttachPoint(EasyObject<TzDbMText>& text,
                       TzDbMText::AttachmentPoint newPoint,
                       double height) {
    double width = text->width();
    if (height == kMeasureHeight) height = text->actualHeight(nullptr);
    if (width == 0) width = text->actualWidth();

    TzGeVector3d const direction = text->direction();
    TzGeVector3d const across = direction * width;
    TzGeVector3d const down = direction.crossProduct(text->normal()) * height;
    BoxFactors const from = factorsOf(text->attachment());
    BoxFactors const to = factorsOf(newPoint);
    TzGePoint3d const topLeft = text->location() - across * from.width - down * from.height;
    // A place that is not finite is refused, and the text stays where it is.
    (void)text->setLocation(topLeft + across * to.width + down * to.height);
}
