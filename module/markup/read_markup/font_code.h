#pragma once

#include "tz/text/charset.h"
#include "tz/text/std_str.h"

// What a font code of the markup says. A code that the end of the text cuts off gives what was read
// until then.
struct FontCode {
    CStdStrW name;  // of the file or face, with every backslash doubled
    bool bold = false;
    bool italic = false;
    bool hasCharset = false;
    Charset charset = kDefaultCharset;
    int pitch = 0;
};

// The code of a file, from the character after `\F` on. Its one field is the set; the ";" is
// consumed, with fields or without.
[[nodiscard]] FontCode readFileCode(wchar_t const*& cursor);

// The code of a face, from the character after `\f` on. The cursor stops at the ";". Without fields
// that ";" is no part of the code and comes out as text, unlike that of a file; `hasFields` tells.
[[nodiscard]] FontCode readFaceCode(wchar_t const*& cursor, bool& hasFields);
