#include "module/markup/shared/font_families.h"

namespace {

struct FamilyRow {
    int family;
    wchar_t const* word;
};
constexpr FamilyRow kFamilies[] = {
    {0x10, L"froman"}, {0x20, L"fswiss"}, {0x30, L"fmodern"}, {0x40, L"fscript"}, {0x50, L"fdecor"},
};
constexpr int kFamilyBits = 0xF0;

}  // namespace

int familyOf(std::wstring_view word) {
    for (FamilyRow const& row : kFamilies) {
        if (row.word == word) return row.family;
    }
    return 0;
}

wchar_t const* familyWord(int pitchAndFamily) {
    for (FamilyRow const& row : kFamilies) {
        if (row.family == (pitchAndFamily & kFamilyBits)) return row.word;
    }
    return L"fnil";
}
