#include "host/layout/attachment_box.h"

#include "host/layout/line_layout.h"

namespace tzhost {

AttachmentShares attachmentShares(int attachment, LayoutStyle const& style) {
    int const index = attachment >= 1 && attachment <= 9 ? attachment - 1 : 0;
    double const column = index % 3 / 2.0;
    double const row = index / 3 / 2.0;
    if (hasVerticalMark(style)) return {1.0 - row, column};
    return {column, row};
}

LayoutBox boxAt(AttachmentShares const& shares, double width, double height) {
    LayoutBox box;
    box.left = -shares.along * width;
    box.right = box.left + width;
    box.top = shares.down * height;
    box.bottom = box.top - height;
    return box;
}

}  // namespace tzhost
