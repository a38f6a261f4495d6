// Faces that are lent to files for which no face is known.

#include "tz/mte/font_map_database.h"
#include "tz/mte/globals.h"
#include "tz/pal/ini_file.h"

namespace {

// The name in lower case with the extension of stroke fonts, which is not doubled.
CStdStrW asStrokeFont(CStdStrW file) {
    file.MakeLower();
    if (!file.ends_with(gsExtensionSHX.str())) file += gsExtensionSHX.str();
    return file;
}

}  // namespace

CStdStrW CMTextFontMapDatabase::GetProxyTypeFace(int index) const {
    TzString const key = TzString::formatted(L"Proxy %d", index + 1);
    return CIniFile(gsIniFileDatabase, gszIniSectProxyFiles).GetString(key, L"");
}

CStdStrW CMTextFontMapDatabase::GetEmergencyProxy() const {
    return CIniFile(gsIniFileDatabase, gszIniSectProxyFiles).GetString(L"Default", L"txt");
}

CStdStrW CMTextFontMapDatabase::AddProxy(CStdStrW file) {
    int const index = m_nProxiesAssigned++;
    CStdStrW const face = GetProxyTypeFace(index);
    if (face.empty()) {
        m_bProxiesExhausted = true;
        return GetEmergencyProxy();
    }
    AddFontSubstitute(std::move(file), face, false, false, kAnsiCharset, 0, MapTypeProxy, 0);
    return face;
}

// All pairs share one face, so the way back from it leads to the pair that was added last.
CStdStrW
CMTextFontMapDatabase::AddBigfontProxy(CStdStrW file, CStdStrW big, signed char /*unused*/) {
    CStdStrW const proxy(m_sBigfontProxy);
    Charset charset = kAnsiCharset;
    int pitch = 0;
    GetOsFontInfo(proxy, charset, pitch);
    AddFontSubstitute(asStrokeFont(std::move(file)) + L"," + asStrokeFont(std::move(big)), proxy,
                      false, false, charset, pitch, MapTypeProxy, 0);
    return proxy;
}

CStdStrW CMTextFontMapDatabase::AddBigfontProxy(CStdStrW spec, signed char /*unused*/) {
    int const comma = spec.Find(L',');
    if (comma < 0) return {};
    return AddBigfontProxy(spec.Left(comma), spec.Mid(comma + 1), 0);
}

void CMTextFontMapDatabase::SetBigfont(CStdStrW file, CStdStrW big) {
    AddBigfontProxy(std::move(file), std::move(big), 0);
}

void CMTextFontMapDatabase::SetBigfont(CStdStrW spec) {
    AddBigfontProxy(std::move(spec), 0);
}

bool CMTextFontMapDatabase::IsBigfontProxyFont(CStdStrW const& face) const {
    return face.CompareNoCase(m_sBigfontProxy) == 0;
}

void CMTextFontMapDatabase::FixupFontBox(CMTextFontList* list) {
    for (auto const& [key, each] : m_mapFileToFont) {
        auto const& entry = static_cast<CMTextFileToFontMapEntry const&>(*each);
        switch (entry.m_eMapType) {
        case MapTypeShx: list->AddShxFont(entry.m_sFaceName); break;
        case MapTypeProxy: list->AddAssignedProxy(entry.m_sFaceName, key); break;
        case MapTypeMisc: list->AddMiscFont(entry.m_sFaceName); break;
        default: break;  // the list is not offered entries of other types
        }
    }
    for (int index = m_nProxiesAssigned;; ++index) {
        CStdStrW const face = GetProxyTypeFace(index);
        if (face.empty()) return;
        list->AddFreeProxy(face);
    }
}

bool GetOsFontInfo(CStdStrW const& /*face*/, Charset& /*charset*/, int& /*pitch*/) {
    return true;
}

int font_supports_charset(wchar_t const* /*face*/, int /*charset*/) {
    return 1;
}

void find_supporting_font(int /*charset*/, CStdStrW& /*face*/, int& /*pitch*/) {}
