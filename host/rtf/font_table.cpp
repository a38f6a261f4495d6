#include "host/rtf/font_table.h"

#include <utility>

#include "host/code_pages/code_page_table.h"

namespace tzhost {

namespace {

constexpr std::size_t kLongestName = 255;
constexpr int kMostPitch = 3;
constexpr int kMostCharset = 255;

struct FamilyRow {
    std::string_view word;
    int family;
};
constexpr FamilyRow kFamilies[] = {
    {"fnil", 0x00},    {"froman", 0x10},  {"fswiss", 0x20},
    {"fmodern", 0x30}, {"fscript", 0x40}, {"fdecor", 0x50},
};

// The value, or 0 when it is none of 0 to `most`.
int within(int value, int most) {
    return value < 0 || value > most ? 0 : value;
}

}  // namespace

void RtfFontTable::takeWord(std::string_view word, int value) {
    if (word == "f") number_ = value;
    if (word == "fcharset") font_.face.charset = within(value, kMostCharset);
    if (word == "fprq") font_.face.pitch = within(value, kMostPitch);
    if (word == "cpg") font_.codePage = value;
    for (FamilyRow const& row : kFamilies) {
        if (row.word == word) font_.face.family = row.family;
    }
}

void RtfFontTable::takeLetter(wchar_t c) {
    if (font_.face.name.size() < kLongestName) font_.face.name += c;
}

void RtfFontTable::endFont() {
    RtfFont font = std::exchange(font_, {});
    int const number = std::exchange(number_, -1);
    if (number < 0 || font.face.name.empty()) return;
    if (font.codePage == 0) font.codePage = codePageOf(static_cast<Charset>(font.face.charset));
    fonts_[number] = std::move(font);
}

int RtfFontTable::namePage() const {
    return font_.codePage != 0 ? font_.codePage
                               : codePageOf(static_cast<Charset>(font_.face.charset));
}

RtfFont const* RtfFontTable::find(int number) const {
    auto const at = fonts_.find(number);
    return at == fonts_.end() ? nullptr : &at->second;
}

}  // namespace tzhost
