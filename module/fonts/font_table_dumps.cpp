// The tables as sections of an INI file, for developers.

#include "tz/mte/font_map_catalogue.h"
#include "tz/pal/ini_file.h"

namespace {

constexpr wchar_t const* gszFontToFileSection = L"Fonts to Files";
constexpr wchar_t const* gszFontToFileTemplate = L"%s,%s,%s,%s";
constexpr wchar_t const* gszFileToFontSection = L"Files to Fonts";
constexpr wchar_t const* gszFileToFontTemplate = L"%s [B%d I%d F%d C%d]";

void beginSection(wchar_t const* section, wchar_t const* file, signed char append) {
    if (!append) WritePrivateProfileString(section, nullptr, nullptr, file);
}

}  // namespace

void CTzadFontMapDatabase::WriteDatabaseToDisk(wchar_t const* file, signed char append) {
    WriteFontToFileMapToDisk(file, append);
    WriteFileToFontMapToDisk(file, append);
}

void CTzadFontMapDatabase::WriteFontToFileMapToDisk(wchar_t const* file, signed char append) {
    beginSection(gszFontToFileSection, file, append);
    for (auto const& [key, each] : m_mapFontToFile) {
        auto const& entry = static_cast<CTzadFontToFileMapEntry const&>(*each);
        CStdStrW value;
        value.Fmt(gszFontToFileTemplate, entry.m_sRegular.c_str(), entry.m_sBold.c_str(),
                  entry.m_sItalic.c_str(), entry.m_sBoldItalic.c_str());
        WritePrivateProfileString(gszFontToFileSection, key.c_str(), value.c_str(), file);
    }
}

void CTzadFontMapDatabase::WriteFileToFontMapToDisk(wchar_t const* file, signed char append) {
    beginSection(gszFileToFontSection, file, append);
    for (auto const& [key, each] : m_mapFileToFont) {
        auto const& entry = static_cast<CTzadFileToFontMapEntry const&>(*each);
        CStdStrW value;
        value.Fmt(gszFileToFontTemplate, entry.m_logFont.lfFaceName, entry.m_bBold ? 1 : 0,
                  entry.m_bItalic ? 1 : 0, entry.m_logFont.lfPitchAndFamily,
                  entry.m_logFont.lfCharSet);
        WritePrivateProfileString(gszFileToFontSection, key.c_str(), value.c_str(), file);
    }
}
