#pragma once

#include "tz/text/std_str.h"

// Which way a text with fields goes.
enum FieldBackslashes : signed char {
    kHalveBackslashes = 0,  // from the editor: each pair becomes one
    kDoubleBackslashes = 1  // to the editor, which reads a single one as the start of a code
};

// Rewrites the backslashes inside the fields of a text, so that field codes pass through the
// converters as they are; the text around the fields is left alone. Any `flag` but 0 doubles.
void convertBackslashesInFields(CStdStrW& text, signed char flag);
