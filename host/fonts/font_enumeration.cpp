#include "tz/pal/font_enumeration.h"

#include <cwchar>
#include <string>

#include "host/base/fault_point.h"
#include "host/fonts/machine_catalogue.h"
#include "tz/text/font_info.h"

// Nothing is drawn through a device context; it only shows that a window was there.
struct TzDeviceContext {};

namespace {

using tzhost::FontCatalogue;
using tzhost::FontFamilyRow;
using tzhost::FontForm;

constexpr TzDeviceContext kContext{};
constexpr int kOutlineFont = 4;
constexpr std::int32_t kBoldWeight = 700;
constexpr std::int32_t kRegularWeight = 400;

template <std::size_t Size>
void copyName(std::wstring const& name, wchar_t (&field)[Size]) {
    std::size_t const length = name.copy(field, Size - 1);
    field[length] = 0;
}

wchar_t const* styleOf(FontForm const& form) {
    if (form.isBold()) return form.isItalic() ? L"Bold Italic" : L"Bold";
    return form.isItalic() ? L"Italic" : L"Regular";
}

int report(FontFamilyRow const& family,
           FontForm const& form,
           FONTENUMPROCW callback,
           long long userData) {
    CFontInfoItem item;
    (void)tzFontInfo().FontInfoFromTypeFaceName(family.english, item);  // it is in the catalogue
    tagENUMLOGFONTW face{};
    LOGFONTW& font = face.elfLogFont;
    font.lfWeight = form.isBold() ? kBoldWeight : kRegularWeight;
    font.lfItalic = form.isItalic() ? 1 : 0;
    font.lfCharSet = static_cast<std::uint8_t>(tzhost::charsetOf(form));
    font.lfPitchAndFamily =
        static_cast<std::uint8_t>(getPitchAndFamilyValueFromEnum(item.pitch, item.family));
    copyName(family.english, font.lfFaceName);
    copyName(family.english + L' ' + styleOf(form), face.elfFullName);
    copyName(styleOf(form), face.elfStyle);
    tagNEWTEXTMETRICW metrics{};
    metrics.tmWeight = font.lfWeight;
    metrics.tmItalic = font.lfItalic;
    metrics.tmCharSet = font.lfCharSet;
    metrics.tmPitchAndFamily = font.lfPitchAndFamily;
    return callback(&face, &metrics, kOutlineFont, userData);
}

}  // namespace

HDC GetDC(HWND window) {
    if (tzhost::faultAt("GetDC") || window == nullptr) return nullptr;
    return &kContext;
}

int ReleaseDC(HWND, HDC device) {
    return device != nullptr ? 1 : 0;
}

int EnumFontFamilies(HDC device,
                     wchar_t const* family,
                     FONTENUMPROCW callback,
                     long long userData) {
    int result = 1;
    if (tzhost::faultAt("EnumFontFamilies") || device == nullptr || callback == nullptr)
        return result;
    if (family != nullptr) {
        FontFamilyRow const* const row = FontCatalogue::instance().family(family);
        if (row == nullptr) return result;
        for (FontForm const* const form : row->forms) {
            result = report(*row, *form, callback, userData);
            if (result == 0) break;
        }
        return result;
    }
    for (FontFamilyRow const* const row : FontCatalogue::instance().families()) {
        result = report(*row, row->nearest(false, false), callback, userData);
        if (result == 0) break;
    }
    return result;
}
