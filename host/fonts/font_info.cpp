#include "tz/text/font_info.h"

#include <string_view>

#include "host/base/fault_point.h"
#include "host/files/ini_data.h"
#include "host/fonts/machine_catalogue.h"
#include "host/fonts/machine_fonts.h"

namespace {

using tzhost::FontCatalogue;
using tzhost::FontFamilyRow;
using tzhost::FontForm;

struct FamilyWord {
    std::wstring_view word;  // in lower case
    FontFamily family;
};

// Words in a face's name that tell its family; the first row that is found decides. The name has to
// be asked because the catalogue does not tell faces with serifs from those without.
constexpr FamilyWord kFamilyWords[] = {
    {L"sans", FontFamily::kSwiss},        {L"serif", FontFamily::kRoman},
    {L"roman", FontFamily::kRoman},       {L"times", FontFamily::kRoman},
    {L"script", FontFamily::kScript},     {L"handwriting", FontFamily::kScript},
    {L"symbol", FontFamily::kDecorative}, {L"dingbats", FontFamily::kDecorative},
};

FontPitch pitchOf(FontForm const& form) {
    return form.isFixedPitch ? FontPitch::kFixed : FontPitch::kVariable;
}

FontFamily familyOf(FontForm const& form) {
    if (form.isFixedPitch) return FontFamily::kModern;
    std::wstring const name = tzhost::lowered(form.english);
    for (FamilyWord const& row : kFamilyWords) {
        if (name.find(row.word) != name.npos) return row.family;
    }
    return FontFamily::kDoNotCare;
}

// Callers handle stroke fonts themselves: such a file is unknown here, even when the machine has a
// file of that name.
bool isStrokeFont(CStdStrW const& file) {
    constexpr std::wstring_view kExtension = L".shx";
    std::wstring const name = tzhost::lowered(file);
    return name.size() >= kExtension.size() &&
           name.compare(name.size() - kExtension.size(), kExtension.size(), kExtension) == 0;
}

FontFamilyRow const* findFamily(std::string_view operation, CStdStrW const& face) {
    if (tzhost::faultAt(operation)) return nullptr;
    return FontCatalogue::instance().family(face);
}

class CatalogueFontInfo : public CFontInfo {
public:
    bool FileToFontName(CStdStrW const& file,
                        CStdStrW& face,
                        bool& bold,
                        bool& italic,
                        Charset& charset,
                        FontPitch& pitch,
                        FontFamily& family) const override;
    bool
    FontNameToFile(CStdStrW const& face, bool bold, bool italic, CStdStrW& file) const override;
    bool FontInfoFromTypeFaceName(CStdStrW const& face, CFontInfoItem& item) const override;
    [[nodiscard]] CStdStrW TypefaceNativeToEnglish(CStdStrW const& face) const override;
    [[nodiscard]] CStdStrW TypefaceEnglishToNative(CStdStrW const& face) const override;
};

bool CatalogueFontInfo::FileToFontName(CStdStrW const& file,
                                       CStdStrW& face,
                                       bool& bold,
                                       bool& italic,
                                       Charset& charset,
                                       FontPitch& pitch,
                                       FontFamily& family) const {
    face = CStdStrW();
    bold = italic = false;
    charset = kAnsiCharset;
    pitch = FontPitch::kDefault;
    family = FontFamily::kDoNotCare;
    if (tzhost::faultAt("CFontInfo::FileToFontName") || isStrokeFont(file)) return false;
    FontForm const* const form = FontCatalogue::instance().file(file);
    if (form == nullptr) return false;
    face = form->english;
    bold = form->isBold();
    italic = form->isItalic();
    charset = tzhost::charsetOf(*form);
    pitch = pitchOf(*form);
    family = familyOf(*form);
    return true;
}

bool CatalogueFontInfo::FontNameToFile(CStdStrW const& face,
                                       bool bold,
                                       bool italic,
                                       CStdStrW& file) const {
    FontFamilyRow const* const family = findFamily("CFontInfo::FontNameToFile", face);
    file = family ? CStdStrW(family->nearest(bold, italic).fileName) : CStdStrW();
    return family != nullptr;
}

bool CatalogueFontInfo::FontInfoFromTypeFaceName(CStdStrW const& face, CFontInfoItem& item) const {
    item = CFontInfoItem();
    FontFamilyRow const* const family = findFamily("CFontInfo::FontInfoFromTypeFaceName", face);
    if (family == nullptr) return false;
    FontForm const& form = family->nearest(false, false);
    item.faceName = family->english;
    item.fileName = form.fileName;
    item.charset = tzhost::charsetOf(form);
    item.pitch = pitchOf(form);
    item.family = familyOf(form);
    item.hasBold = family->has(true, false);
    item.hasItalic = family->has(false, true);
    return true;
}

CStdStrW CatalogueFontInfo::TypefaceNativeToEnglish(CStdStrW const& face) const {
    if (tzhost::faultAt("CFontInfo::TypefaceNativeToEnglish")) return face;
    CStdStrW const english = tzhost::englishNameOf(face);
    bool const isEnglish = english.empty() || tzCompareNoCase(english.c_str(), face.c_str()) == 0;
    return isEnglish ? face : english;
}

CStdStrW CatalogueFontInfo::TypefaceEnglishToNative(CStdStrW const& face) const {
    FontFamilyRow const* const family = findFamily("CFontInfo::TypefaceEnglishToNative", face);
    if (family == nullptr || family->native == family->english) return face;
    return family->native;
}

}  // namespace

CFontInfo& tzFontInfo() {
    static CatalogueFontInfo service;
    return service;
}

int getPitchAndFamilyValueFromEnum(FontPitch pitch, FontFamily family) {
    return static_cast<int>(pitch) | static_cast<int>(family);
}
