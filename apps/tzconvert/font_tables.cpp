#include "apps/tzconvert/font_tables.h"

#include <utility>

#include "host/files/ini_data.h"
#include "tz/mte/font_map_database.h"
#include "tz/pal/ini_file.h"

namespace tzconvert {

// A conversion adds proxies alone, which go with its font map object. One with a key of its own
// leaves the tables as they were; one that took the place of an entry leaves an entry less. So
// tables of the same sizes hold the same entries.
bool FontTables::areFresh() const {
    return CMTextFontMapDatabase::m_mapFileToFont.size() == files_ &&
           CMTextFontMapDatabase::m_mapFontToFile.size() == faces_;
}

void FontTables::prepare() {
    auto map = tzhost::openIni(GetMTextMapFilename().toUtf8());  // another one when it has changed
    if (map == map_ && areFresh()) return;
    CMTextFontMapDatabase fonts(0);
    fonts.ResetContents();
    fonts.BuildDatabase();  // as the first look-up would
    map_ = std::move(map);
    files_ = CMTextFontMapDatabase::m_mapFileToFont.size();
    faces_ = CMTextFontMapDatabase::m_mapFontToFile.size();
}

}  // namespace tzconvert
