#pragma once

#include <array>

#include "module/texts/text_ids.h"
#include "tz/db/mtext.h"

// Attachment points and the ids of their keywords, in both directions.

// The keywords of the points in the order of their numbers, which is also the prompt's order.
inline constexpr std::array<unsigned int, 9> kAttachmentKeywords{
    kText.topLeft,     kText.topCentre,  kText.topRight,     kText.middleLeft,  kText.middleCentre,
    kText.middleRight, kText.bottomLeft, kText.bottomCentre, kText.bottomRight,
};

// The point of a keyword; the top left one for any other id.
[[nodiscard]] TzDbMText::AttachmentPoint MapAttachment(unsigned int id);
// The keyword of a point; that of the top left one for a value that is none.
[[nodiscard]] unsigned int MapAttachmentToIDS(TzDbMText::AttachmentPoint point);
