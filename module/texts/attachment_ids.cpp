#include "module/texts/attachment_ids.h"

namespace {

constexpr unsigned int kTopLeftId = 1048;
constexpr unsigned int kTopToBottomId = 1058;

}  // namespace

TzDbMText::AttachmentPoint MapAttachment(unsigned int id) {
    bool const known = id >= kTopLeftId && id - kTopLeftId < TzDbMText::kBottomRight;
    return known ? static_cast<TzDbMText::AttachmentPoint>(id - kTopLeftId + TzDbMText::kTopLeft)
                 : TzDbMText::kTopLeft;
}

unsigned int MapAttachmentToIDS(TzDbMText::AttachmentPoint point) {
    if (point < TzDbMText::kTopLeft || point > TzDbMText::kBottomRight) return kTopLeftId;
    return kTopLeftId + static_cast<unsigned int>(point - TzDbMText::kTopLeft);
}

TzDbMText::FlowDirection MapDirection(unsigned int id) {
    return id == kTopToBottomId ? TzDbMText::kTtoB : TzDbMText::kLtoR;
}
