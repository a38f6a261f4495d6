#pragma once

#include "tz/db/mtext.h"
#include "tz/mte/easy_object.h"

// Keeps a text where it stands on the page when another of the nine points of its box becomes the
// one that it is attached to.
//
//   UpdateAttachPoint(text, TzDbMText::kBottomRight, kMeasureHeight);
//   text->setAttachment(TzDbMText::kBottomRight);

// As a box height: the height of the text as it is laid out.
inline constexpr double kMeasureHeight = -1.0;

// Moves the location of a text, open for write, from its present attachment point to `newPoint` of
// the same box; the attachment itself stays. The box is as wide as the text's width, or as the text
// when that is 0, and `height` drawing units high, 0 included.
void UpdateAttachPoint(EasyObject<TzDbMText>& text,
                       TzDbMText::AttachmentPoint newPoint,
                       double height);
