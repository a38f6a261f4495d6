#include "tz/mte/font_map_catalogue.h"

#include <system_error>

#include "module/texts/resources.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/print.h"

namespace {

// The entry under the lower-cased key as what the read operations expect, or null.
template <class Entry, class Table>
Entry const* findEntry(Table const& table, CStdStrW& key) {
    key.MakeLower();
    auto const at = table.find(key);
    return at == table.end() ? nullptr : static_cast<Entry const*>(at->second);
}

void dropAt(CStdStrW& face) {
    if (!face.empty() && face.front() == L'@') face.erase(0, 1);
}

}  // namespace

CTzadFontMapDatabase::CTzadFontMapDatabase(signed char flag) {
    if (m_sTechnologyTrueType.isEmpty()) {
        m_sTechnologyTrueType = loadResourceString(kText.trueTypeFace);
        m_sTechnologyDevice = loadResourceString(kText.deviceFace);
        m_sTechnologyRaster = loadResourceString(kText.rasterFace);
        m_sTechnologyVector = loadResourceString(kText.vectorFace);
    }
    // A constructor calls the operations of its own class, never those of a derived class.
    if (!CTzadFontMapDatabase::IsDatabaseLoaded()) CTzadFontMapDatabase::LoadContents(flag);
}

CTzadFontMapDatabase::~CTzadFontMapDatabase() = default;

bool CTzadFontMapDatabase::IsDatabaseLoaded() {
    return m_eDatabaseStatus == kLoaded;
}

void CTzadFontMapDatabase::LoadContents(signed char /*flag*/) {
    if (m_eDatabaseStatus == kLoaded) return;
    bool const isLoadedElsewhere = m_eDatabaseStatus == kLoading;
    if (isLoadedElsewhere) tzutPrintf(gStringTable[kText.loadingElsewhere]);
    try {
        std::lock_guard const lock(m_mutexLoading);
        if (isLoadedElsewhere) {
            tzutPrintf(gStringTable[kText.loadedElsewhere]);
        } else {
            m_eDatabaseStatus = kLoaded;
        }
    } catch (std::system_error const&) {
        // A lock that cannot be had leaves the status as it is.
    }
}

void CTzadFontMapDatabase::ResetContents() {
    try {
        std::lock_guard const lock(m_mutexLoading);
        RemoveAllFileToFontMapEntries();
        RemoveAllFontToFileMapEntries();
        m_eDatabaseStatus = kNotLoaded;
    } catch (std::system_error const&) {
        // A lock that cannot be had leaves the tables as they are.
    }
}

CStdStrW CTzadFontMapDatabase::MapFileToFont(
    CStdStrW file, bool& bold, bool& italic, int& charset, int& family) {
    auto const* const entry = findEntry<CTzadFileToFontMapEntry>(m_mapFileToFont, file);
    bold = entry && entry->m_bBold;
    italic = entry && entry->m_bItalic;
    charset = entry ? entry->m_logFont.lfCharSet : 0;
    family = entry ? entry->m_logFont.lfPitchAndFamily : 0;
    return entry ? CStdStrW(entry->m_logFont.lfFaceName) : CStdStrW();
}

CStdStrW CTzadFontMapDatabase::MapFontToFile(
    CStdStrW face, bool bold, bool italic, int /*charset*/, int /*family*/) {
    dropAt(face);
    auto const* const entry = findEntry<CTzadFontToFileMapEntry>(m_mapFontToFile, face);
    if (!entry) return {};
    if (bold && italic) return entry->m_sBoldItalic;
    if (bold) return entry->m_sBold;
    return italic ? entry->m_sItalic : entry->m_sRegular;
}

bool CTzadFontMapDatabase::GetFontSynthesisInfo(CStdStrW face,
                                                bool* bold,
                                                bool* italic,
                                                bool* boldItalic) {
    auto const* const entry = findEntry<CTzadFontToFileMapEntry>(m_mapFontToFile, face);
    if (!entry) return false;
    if (bold) *bold = entry->m_sBold.empty();
    if (italic) *italic = entry->m_sItalic.empty();
    if (boldItalic) *boldItalic = entry->m_sBoldItalic.empty();
    return true;
}
