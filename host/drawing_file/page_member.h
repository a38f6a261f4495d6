#pragma once

#include "host/drawing_file/member_writer.h"
#include "host/drawing_file/read_context.h"

// The member "page" of a drawing.
namespace tzhost::drawingfile {

// Members left out are as those of a new page; null is none.
void readPage(ReadContext& context, JsonValue const& value, std::optional<Page>& page);

void writePage(MemberWriter& members, Page const& page);

}  // namespace tzhost::drawingfile
