#pragma once

#include "tz/db/mtext.h"

// Attachment points and flow directions against the ids of their keywords.

// Keywords 1048 to 1056 are the points in their order; any other id gives the top left one.
[[nodiscard]] TzDbMText::AttachmentPoint MapAttachment(unsigned int id);
// The keyword of a point; 1048, top left, for a value that is none.
[[nodiscard]] unsigned int MapAttachmentToIDS(TzDbMText::AttachmentPoint point);
// Keyword 1058 is top to bottom, any other id left to right.
[[nodiscard]] TzDbMText::FlowDirection MapDirection(unsigned int id);
