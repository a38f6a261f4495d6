#pragma once

#include "tz/mte/font_map_database.h"

// What the table alone says of a face: the entry of exactly that description, or null. The font
// service is not asked: it takes long at its first question, and who calls this takes no notice of
// the file that it would name. Fills the table when it is empty; valid until the table changes.
[[nodiscard]] CMTextFontToFileMapEntry const* fontEntry(CMTextFontMapDatabase& fonts,
                                                        CStdStrW const& face,
                                                        bool bold,
                                                        bool italic,
                                                        Charset charset,
                                                        int pitch);
