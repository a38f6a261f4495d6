#include "host/fonts/machine_fonts.h"

#include <algorithm>
#include <memory>
#include <unordered_map>

#include "host/files/ini_data.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

bool flagOf(FcPattern* pattern, char const* property) {
    FcBool value = FcFalse;
    return FcPatternGetBool(pattern, property, 0, &value) == FcResultMatch && value == FcTrue;
}

// Leaves out bitmap fonts, which cannot be drawn at any size, and variable fonts as a whole, since
// each of their named forms is listed by itself.
bool isUsable(FcPattern* pattern) {
    return flagOf(pattern, FC_SCALABLE) && !flagOf(pattern, FC_VARIABLE);
}

// Owns the patterns and their character sets.
FcConfig* configuration() {
    static std::unique_ptr<FcConfig, void (*)(FcConfig*)> const config(FcInitLoadConfigAndFonts(),
                                                                       &FcConfigDestroy);
    return config.get();
}

std::vector<FcPattern*> readFonts() {
    std::vector<FcPattern*> usable;
    FcConfig* const config = configuration();
    FcFontSet const* const all = config ? FcConfigGetFonts(config, FcSetSystem) : nullptr;
    for (int i = 0; all != nullptr && i < all->nfont; ++i)
        if (isUsable(all->fonts[i])) usable.push_back(all->fonts[i]);
    return usable;
}

using Names = std::unordered_map<std::wstring, std::wstring>;

Names readEnglishNames() {
    Names names;
    for (FcPattern* const font : machineFonts()) {
        auto const ofFont = familyNames(font);
        auto const english = std::find_if(ofFont.begin(), ofFont.end(),
                                          [](FamilyName const& each) { return each.isEnglish; });
        for (FamilyName const& each : ofFont)
            names.try_emplace(lowered(each.name), each.isEnglish ? each.name : english->name);
    }
    return names;
}

}  // namespace

std::vector<FcPattern*> const& machineFonts() {
    static std::vector<FcPattern*> const fonts = readFonts();
    return fonts;
}

std::string fontText(FcPattern* pattern, char const* property, int index) {
    FcChar8* value = nullptr;
    if (FcPatternGetString(pattern, property, index, &value) != FcResultMatch) return {};
    return reinterpret_cast<char const*>(value);  // fontconfig's characters are unsigned
}

std::vector<FamilyName> familyNames(FcPattern* pattern) {
    std::vector<FamilyName> names;
    for (int i = 0;; ++i) {
        std::wstring name = fromUtf8(fontText(pattern, FC_FAMILY, i));
        if (name.empty()) break;
        names.push_back({std::move(name), fontText(pattern, FC_FAMILYLANG, i) == "en"});
    }
    bool const hasEnglish = std::any_of(names.begin(), names.end(),
                                        [](FamilyName const& each) { return each.isEnglish; });
    if (!hasEnglish && !names.empty()) names[0].isEnglish = true;
    return names;
}

std::wstring englishNameOf(std::wstring_view face) {
    static Names const names = readEnglishNames();
    auto const at = names.find(lowered(face));
    return at == names.end() ? std::wstring() : at->second;
}

}  // namespace tzhost
