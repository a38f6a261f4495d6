#pragma once

#include "host/layout/layout_types.h"

// Where the box of an MTEXT stands about its attachment point: drawn, measured and picked alike.
namespace tzhost {

// The share of the box's width that lies left of the attachment point, and the share of its height
// that lies above it: 0, 0.5 or 1.
struct AttachmentShares {
    double along = 0.0;
    double down = 0.0;
};

// What an attachment from 1 to 9 says in a style, any other number counting as 1. An attachment of
// a typeface with "@" counts in a frame turned by 270 degrees, as its previews do: left is the head
// of the page, top its right side.
[[nodiscard]] AttachmentShares attachmentShares(int attachment, LayoutStyle const& style);

// A box of that size about the attachment point.
[[nodiscard]] LayoutBox boxAt(AttachmentShares const& shares, double width, double height);

}  // namespace tzhost
