// The colour table of a document.

#include "module/markup/rtf_to_mtext.h"
#include "module/markup/rtf_tokens.h"

namespace {

constexpr int kByte = 0xFF;

struct Components {
    int red = kByte;
    int green = kByte;
    int blue = kByte;

    [[nodiscard]] unsigned int rgb() const {
        auto const shifted = static_cast<unsigned int>(green) << 8;
        return (static_cast<unsigned int>(blue) << 16) | (shifted & 0xFFFF) |
               static_cast<unsigned int>(red);
    }
};

void takeWord(Components& components, std::wstring_view word, int value) {
    if (word == L"red") components.red = value & kByte;
    if (word == L"green") components.green = value;
    if (word == L"blue") components.blue = value & kByte;
}

}  // namespace

// Any character that belongs to no word makes the entry the automatic colour, the first of the
// table; so a blank ahead of the ";" does. The closing brace is left to the reader of groups.
void CRichTextToMTextContext::OnColorTable(wchar_t const*& cursor, int) {
    Components components;
    bool isAutomatic = true;
    while (*cursor != 0 && *cursor != L'}') {
        if (*cursor == L'{') {
            skipGroup(cursor);
            continue;
        }
        wchar_t const c = *cursor++;
        if (c == L'\\') {
            int value = 0;
            std::wstring_view const word = GetToken(cursor, value);
            if (!word.empty()) isAutomatic = false;
            takeWord(components, word, value);
            continue;
        }
        if (c == L';') {
            int index = 0;
            if (!isAutomatic) {
                AddColor(components.rgb(), true);
            } else {
                (void)GetColor(0, &index);  // an empty table gives ByBlock
                AddColor(index, true);
            }
            components = {};
        }
        isAutomatic = true;
    }
}
