#include "tz/mte/font_map_database.h"

#include <memory>
#include <utility>

#include "module/fonts/font_entry.h"
#include "module/fonts/font_map_sections.h"
#include "module/fonts/table_key.h"
#include "tz/mte/globals.h"
#include "tz/pal/ini_file.h"
#include "tz/text/font_info.h"

namespace {

// Only a backslash separates folders here.
CStdStrW withoutFolder(CStdStrW file) {
    if (std::size_t const slash = file.rfind(L'\\'); slash != CStdStrW::npos)
        file.erase(0, slash + 1);
    return file;
}

// The key of a file or a pair: each name without its folder, in lower case.
CStdStrW normalised(CStdStrW file) {
    std::size_t const comma = file.find(L',');
    if (comma != CStdStrW::npos) {
        CStdStrW const first = withoutFolder(CStdStrW(file.substr(0, comma)));
        file = first + L"," + withoutFolder(CStdStrW(file.substr(comma + 1)));
    } else {
        file = withoutFolder(std::move(file));
    }
    lowerKey(file);
    return file;
}

// Puts an entry in the place of what stands under the key.
template <class Table, class Key, class Entry>
void store(Table& table, Key&& key, std::unique_ptr<Entry> entry) {
    auto& place = table[std::forward<Key>(key)];
    delete place;
    place = entry.release();
}

template <class Entry, class Table>
void removeOfType(Table& table, CMTextFontMapDatabase::MapType type) {
    for (auto at = table.begin(); at != table.end();) {
        if (static_cast<Entry const*>(at->second)->m_eMapType != type) {
            ++at;
            continue;
        }
        delete at->second;
        at = table.erase(at);
    }
}

bool meansAll(CMTextFontMapDatabase::MapType type) {
    return type == CMTextFontMapDatabase::MapTypeAll ||
           type == CMTextFontMapDatabase::MapTypeSystem;
}

}  // namespace

void leadBack(TableKey const& face, CStdStrW const& file, CMTextFontMapDatabase::MapType type) {
    auto toFile = std::make_unique<CMTextFontToFileMapEntry>();
    toFile->m_sFileName = withoutFolder(file);
    lowerKey(toFile->m_sFileName);
    toFile->m_eMapType = type;
    store(CMTextFontMapDatabase::m_mapFontToFile, CStdStrW(face.view()), std::move(toFile));
}

CMTextFontMapDatabase::CMTextFontMapDatabase(signed char flag) : CTzadFontMapDatabase(flag) {
    gsIniFileDatabase = GetMTextMapFilename();
    m_sBigfontProxy = CIniFile(gsIniFileDatabase, gszIniSectProxyFiles)
                          .GetString(gszIniKeyBigfontProxy, L"System");
    gsExtensionSHX.makeLower();
}

CMTextFontMapDatabase::~CMTextFontMapDatabase() {
    RemoveFileToFontMapEntries(MapTypeProxy);
    RemoveFontToFileMapEntries(MapTypeProxy);
}

bool CMTextFontMapDatabase::AddFontSubstitute(CStdStrW file,
                                              CStdStrW face,
                                              bool bold,
                                              bool italic,
                                              Charset charset,
                                              int pitch,
                                              MapType type,
                                              signed char oneWay) {
    auto toFont = std::make_unique<CMTextFileToFontMapEntry>();
    toFont->m_bBold = bold;
    toFont->m_bItalic = italic;
    toFont->m_eCharset = charset;
    toFont->m_nPitch = pitch;
    toFont->m_sFaceName = face;
    toFont->m_eMapType = type;
    file = withoutFolder(std::move(file));
    lowerKey(file);
    store(m_mapFileToFont, file, std::move(toFont));
    if (!oneWay) leadBack(descriptionKey(face, bold, italic, charset, pitch), file, type);
    return true;
}

CStdStrW CMTextFontMapDatabase::MapFileToFont(
    MapType& type, CStdStrW file, bool& bold, bool& italic, Charset& charset, int& pitch) {
    if (m_mapFileToFont.empty()) BuildDatabase();
    file = normalised(std::move(file));
    auto at = m_mapFileToFont.find(file);
    if (at == m_mapFileToFont.end())
        at = m_mapFileToFont.find(CStdStrW(file + gsExtensionSHX.str()));
    if (at != m_mapFileToFont.end()) {
        auto const& entry = static_cast<CMTextFileToFontMapEntry const&>(*at->second);
        bold = entry.m_bBold;
        italic = entry.m_bItalic;
        charset = entry.m_eCharset;
        pitch = entry.m_nPitch;
        type = entry.m_eMapType;
        file = entry.m_sFaceName;  // reuses the memory of the argument
        return file;
    }
    if (IsBigfontFilespec(file)) {
        CStdStrW const face = AddBigfontProxy(file);
        bold = italic = false;
        GetOsFontInfo(face, charset, pitch);
        type = MapTypeProxy;
        return face;
    }
    CStdStrW face;
    FontPitch fontPitch = FontPitch::kDefault;
    FontFamily fontFamily = FontFamily::kDoNotCare;
    tzFontInfo().FileToFontName(file, face, bold, italic, charset, fontPitch, fontFamily);
    pitch = getPitchAndFamilyValueFromEnum(fontPitch, fontFamily);
    type = face.empty() ? MapTypeProxy : MapTypeSystem;
    return face.empty() ? AddProxy(file) : face;
}

CStdStrW CMTextFontMapDatabase::MapFontToFile(
    MapType& type, CStdStrW face, bool bold, bool italic, Charset charset, int pitch) {
    if (auto const* const entry = fontEntry(*this, face, bold, italic, charset, pitch)) {
        type = entry->m_eMapType;
        face = entry->m_sFileName;  // reuses the memory of the argument
        return face;
    }
    type = MapTypeSystem;
    CStdStrW file;
    tzFontInfo().FontNameToFile(face, bold, italic, file);
    return file;
}

CMTextFontToFileMapEntry const* fontEntry(CMTextFontMapDatabase& fonts,
                                          CStdStrW const& face,
                                          bool bold,
                                          bool italic,
                                          Charset charset,
                                          int pitch) {
    auto const& table = CMTextFontMapDatabase::m_mapFontToFile;
    if (table.empty()) fonts.BuildDatabase();
    auto const at = table.find(descriptionKey(face, bold, italic, charset, pitch).view());
    return at == table.end() ? nullptr : static_cast<CMTextFontToFileMapEntry const*>(at->second);
}

void CMTextFontMapDatabase::RemoveFileToFontMapEntries(MapType type) {
    if (meansAll(type)) return RemoveAllFileToFontMapEntries();
    removeOfType<CMTextFileToFontMapEntry>(m_mapFileToFont, type);
}

void CMTextFontMapDatabase::RemoveFontToFileMapEntries(MapType type) {
    if (meansAll(type)) return RemoveAllFontToFileMapEntries();
    removeOfType<CMTextFontToFileMapEntry>(m_mapFontToFile, type);
}

bool CMTextFontMapDatabase::IsBigfontFilespec(CStdStrW const& spec) {
    return spec.Find(L',') >= 0;
}
