#include "tz/mte/font_map_database.h"

#include <charconv>
#include <string_view>

namespace {

// Digits by hand: keys are built on every look-up.
void appendNumber(CStdStrW& text, std::wstring_view mark, int number) {
    char digits[16];
    char const* const end = std::to_chars(digits, digits + sizeof digits, number).ptr;
    text += mark;
    for (char const* each = digits; each != end; ++each)
        text += static_cast<wchar_t>(*each);
}

}  // namespace

CStdStrW BuildFontDescription(CStdStrW face, bool bold, bool italic, Charset charset, int pitch) {
    face.reserve(face.size() + 32);
    appendNumber(face, L"|b", bold ? 1 : 0);
    appendNumber(face, L"|i", italic ? 1 : 0);
    appendNumber(face, L"|c", charset);
    appendNumber(face, L"|p", pitch);
    face.MakeLower();
    return face;
}
