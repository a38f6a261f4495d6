#include "module/fonts/font_map_sections.h"

#include <utility>

#include "tz/mte/globals.h"

namespace {

int numberField(CStdStrW& rest) {
    return ms_wtoi(ParseField(rest).c_str());
}

}  // namespace

CStdStrW ParseField(CStdStrW& rest) {
    int const comma = rest.Find(L',');
    if (comma < 0) return std::exchange(rest, CStdStrW());
    CStdStrW const field = rest.Left(comma);
    rest.erase(0, static_cast<std::size_t>(comma) + 1);
    return field;
}

CEnumerateMappedFonts::CEnumerateMappedFonts(CMTextFontMapDatabase* database,
                                             TzString const& file,
                                             TzString const& section,
                                             CMTextFontMapDatabase::MapType type)
    : CIniFileEnumerator(file, section), m_pDatabase(database), m_eType(type),
      m_bOneWay(static_cast<signed char>(GetInt(gszIniKeyOneWaySubst, 0))) {}

bool CEnumerateMappedFonts::EnumeratedKey(TzString const& key) {
    if (key == gszIniKeyOneWaySubst) return true;
    CStdStrW rest(GetString(key, L""));
    CStdStrW const face = ParseField(rest);
    bool const bold = numberField(rest) != 0;
    bool const italic = numberField(rest) != 0;
    auto charset = static_cast<Charset>(numberField(rest));
    int const pitch = numberField(rest);
    // The file maps to the face with the last charset. The face with any of the others maps back to
    // the file.
    while (!rest.empty()) {
        if (!m_bOneWay) leadBack(descriptionKey(face, bold, italic, charset, pitch), key, m_eType);
        charset = static_cast<Charset>(numberField(rest));
    }
    m_pDatabase->AddFontSubstitute(key, face, bold, italic, charset, pitch, m_eType, m_bOneWay);
    return true;
}

void CMTextFontMapDatabase::BuildDatabase() {
    // Later sections take the place of earlier ones.
    std::pair<wchar_t const*, MapType> const sections[] = {
        {gszIniSHXSectMapDatabase, MapTypeShx},
        {gszIniPostscriptSectMapDatabase, MapTypePostscript},
        {gszIniMiscSectMapDatabase, MapTypeMisc},
    };
    for (auto const& [section, type] : sections) {
        CEnumerateMappedFonts(this, gsIniFileDatabase, section, type).EnumerateSection();
    }
}
