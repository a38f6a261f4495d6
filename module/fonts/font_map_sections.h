#pragma once

#include "module/fonts/table_key.h"
#include "tz/mte/font_map_database.h"
#include "tz/pal/ini_file.h"

// One section of the font map file, read line by line into the tables.
//
//   file=face,bold,italic,charset,pitch[,charset...]
//   OneWaySubstitution=1      no line of the section maps back
class CEnumerateMappedFonts : public CIniFileEnumerator {
public:
    CEnumerateMappedFonts(CMTextFontMapDatabase* database,
                          TzString const& file,
                          TzString const& section,
                          CMTextFontMapDatabase::MapType type);
    bool EnumeratedKey(TzString const& key) override;

private:
    CMTextFontMapDatabase* m_pDatabase;
    CMTextFontMapDatabase::MapType m_eType;
    signed char m_bOneWay;  // the low eight bits of the key's number: 256 reads as 0
};

// Maps a described face to a file, in the place of an earlier mapping; a folder before the file's
// name is dropped.
void leadBack(TableKey const& face, CStdStrW const& file, CMTextFontMapDatabase::MapType type);

// Cuts the first field, up to a comma, off `rest`; without a comma all of it.
[[nodiscard]] CStdStrW ParseField(CStdStrW& rest);
