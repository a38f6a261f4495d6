#pragma once

// The outline fonts of the machine as fontconfig lists them, and their names. Read once, at the
// first question; everything lives with the process.

#include <string>
#include <string_view>
#include <vector>

#include <fontconfig/fontconfig.h>

namespace tzhost {

// Fonts that can be drawn at any size, each form of a font by itself.
[[nodiscard]] std::vector<FcPattern*> const& machineFonts();

// The value of a property at an index, in UTF-8; empty when the font has no value there.
[[nodiscard]] std::string fontText(FcPattern* pattern, char const* property, int index);

struct FamilyName {
    std::wstring name;
    bool isEnglish;
};
// The family names of a font. When none is marked as English, the first counts as English.
[[nodiscard]] std::vector<FamilyName> familyNames(FcPattern* pattern);

// The English family name of a font that has the given one in any language, case not counting;
// empty for a name that no font has. Costs less than a question to the catalogue, which also reads
// the forms of each font, and gives the same answer: the first font that has the name decides.
[[nodiscard]] std::wstring englishNameOf(std::wstring_view face);

}  // namespace tzhost
