#include "module/texts/attachment_ids.h"

#include <algorithm>

TzDbMText::AttachmentPoint MapAttachment(unsigned int id) {
    auto const at = std::find(kAttachmentKeywords.begin(), kAttachmentKeywords.end(), id);
    if (at == kAttachmentKeywords.end()) return TzDbMText::kTopLeft;
    return static_cast<TzDbMText::AttachmentPoint>(at - kAttachmentKeywords.begin() +
                                                   TzDbMText::kTopLeft);
}

unsigned int MapAttachmentToIDS(TzDbMText::AttachmentPoint point) {
    bool const known = point >= TzDbMText::kTopLeft && point <= TzDbMText::kBottomRight;
    return kAttachmentKeywords[known ? static_cast<std::size_t>(point - TzDbMText::kTopLeft) : 0];
}
