#pragma once

#include "tz/mte/font_map_database.h"

// The table's entry of exactly that description, or null. The font service is not asked: its first
// answer takes long, and the callers of this function do not use the file that it would name. Fills
// the table when it is empty; valid until the table changes.
[[nodiscard]] CMTextFontToFileMapEntry const* fontEntry(CMTextFontMapDatabase& fonts,
                                                        CStdStrW const& face,
                                                        bool bold,
                                                        bool italic,
                                                        Charset charset,
                                                        int pitch);
