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

// The same as MakeLower, which asks the host for plain letters too.
void makeLower(CStdStrW& text) {
    for (wchar_t& c : text) {
        bool const isPlainCapital = c >= L'A' && c <= L'Z';
        if (isPlainCapital)
            c += L'a' - L'A';
        else if (c < 0 || c >= 0x80)
            c = tzToLower(c);
    }
}

}  // namespace

CStdStrW BuildFontDescription(CStdStrW face, bool bold, bool italic, Charset charset, int pitch) {
    makeLower(face);
    face.reserve(face.size() + 32);
    appendNumber(face, L"|b", bold ? 1 : 0);
    appendNumber(face, L"|i", italic ? 1 : 0);
    appendNumber(face, L"|c", charset);
    appendNumber(face, L"|p", pitch);
    return face;
}
