#pragma once

#include <cstdint>

#include "tz/export.h"
#include "tz/pal/windows_calls.h"

// The catalogue of faces, family by family.
//
//   HDC const device = GetDC(GetDesktopWindow());
//   EnumFontFamilies(device, nullptr, &callback, 0);
//   ReleaseDC(GetDesktopWindow(), device);
//
// [any]

using HDC = struct TzDeviceContext const*;

// One face. The character set and the pitch and family are as tz/text/font_info.h gives them.
struct LOGFONTW {
    std::int32_t lfHeight;
    std::int32_t lfWidth;
    std::int32_t lfEscapement;
    std::int32_t lfOrientation;
    std::int32_t lfWeight;  // 400 regular, 700 bold
    std::uint8_t lfItalic;
    std::uint8_t lfUnderline;
    std::uint8_t lfStrikeOut;
    std::uint8_t lfCharSet;
    std::uint8_t lfOutPrecision;
    std::uint8_t lfClipPrecision;
    std::uint8_t lfQuality;
    std::uint8_t lfPitchAndFamily;
    wchar_t lfFaceName[32];
};

struct tagENUMLOGFONTW {
    LOGFONTW elfLogFont;
    wchar_t elfFullName[64];
    wchar_t elfStyle[32];
};

// Measures of a face, of which the host fills the weight, the character set and the pitch and
// family.
struct tagNEWTEXTMETRICW {
    std::int32_t tmHeight;
    std::int32_t tmWeight;
    std::uint8_t tmItalic;
    std::uint8_t tmPitchAndFamily;
    std::uint8_t tmCharSet;
};

// Goes on while it returns something other than 0. Kind 4 is an outline font, the only one here.
using FONTENUMPROCW = int (*)(tagENUMLOGFONTW* face,
                              tagNEWTEXTMETRICW* metrics,
                              int kind,
                              long long userData);

// A device context of the window; null for no window.
[[nodiscard]] TZ_API HDC GetDC(HWND window);
// 1, or 0 for no context.
TZ_API int ReleaseDC(HWND window, HDC device);
// Calls `callback` for one face of each family, by name in order; with a family's name, for each
// face of that family. Returns what the callback returned last, 1 when it was never called.
TZ_API int
EnumFontFamilies(HDC device, wchar_t const* family, FONTENUMPROCW callback, long long userData);
