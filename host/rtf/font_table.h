#pragma once

// The fonts of a document by number, as its table gives them word by word.

#include <string_view>
#include <unordered_map>

#include "host/rtf/dialect_writer.h"

namespace tzhost {

struct RtfFont {
    DialectFont face;
    int codePage = 0;  // of bytes in it; 0: the document's
};

class RtfFontTable {
public:
    // What a word of the table says of the font that it is at. Unknown words say nothing.
    void takeWord(std::string_view word, int value);
    // A character of its name. Names are cut off at a length that no face has.
    void takeLetter(wchar_t c);
    // Ends a font. One without a number or a name is dropped; a later one replaces an earlier one
    // of its number.
    void endFont();

    // The page in which bytes of the name at hand stand; 0: the document's.
    [[nodiscard]] int namePage() const;
    // Null for a number that no font has. It stays where it is.
    [[nodiscard]] RtfFont const* find(int number) const;

private:
    RtfFont font_;
    int number_ = -1;
    std::unordered_map<int, RtfFont> fonts_;
};

}  // namespace tzhost
