// The tables of the process and their emptying.

#include "tz/mte/font_map_catalogue.h"

IFileToFontMapEntry::~IFileToFontMapEntry() = default;
IFontToFileMapEntry::~IFontToFileMapEntry() = default;

CTzadFontMapDatabase::FileToFontMap CTzadFontMapDatabase::m_mapFileToFont;
CTzadFontMapDatabase::FontToFileMap CTzadFontMapDatabase::m_mapFontToFile;
TzString CTzadFontMapDatabase::m_sSystemFontPath;
TzString CTzadFontMapDatabase::m_sRegistryLocation;
TzString CTzadFontMapDatabase::m_sTechnologyTrueType;
TzString CTzadFontMapDatabase::m_sTechnologyDevice;
TzString CTzadFontMapDatabase::m_sTechnologyRaster;
TzString CTzadFontMapDatabase::m_sTechnologyVector;
CTzadFontMapDatabase::DatabaseStatus CTzadFontMapDatabase::m_eDatabaseStatus = kNotLoaded;
std::mutex CTzadFontMapDatabase::m_mutexLoading;

namespace {

template <class Table>
void removeAll(Table& table) {
    for (auto const& [key, entry] : table)
        delete entry;
    table.clear();
}

}  // namespace

void CTzadFontMapDatabase::RemoveAllFileToFontMapEntries() {
    removeAll(m_mapFileToFont);
}
void CTzadFontMapDatabase::RemoveAllFontToFileMapEntries() {
    removeAll(m_mapFontToFile);
}
