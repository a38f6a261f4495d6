// Where a system with a registry lists its fonts, and the search in those lists.

#include "module/fonts/font_locations.h"

#include "tz/mte/font_map_catalogue.h"
#include "tz/pal/settings.h"

namespace {

constexpr wchar_t const* kFontList = L"SOFTWARE\\Microsoft\\Windows NT\\CurrentVersion\\Fonts";
constexpr wchar_t const* kShellFolders =
    L"SOFTWARE\\Microsoft\\Windows\\CurrentVersion\\Explorer\\Shell Folders";

bool endsInFot(CStdStrW const& file) {
    return file.GetLength() >= 5 && file.Right(4).CompareNoCase(L".fot") == 0;
}

}  // namespace

CTwUiRegistryAccess& regLocation() {
    static CTwUiRegistryAccess reg;
    return reg;
}

CTwUiRegistryAccess& regLocationAlt() {
    static CTwUiRegistryAccess reg;
    return reg;
}

CStdStrW SearchForTTCFile(CStdStrW name, CTwUiRegistryAccess& reg) {
    if (int const bracket = name.Find(L'('); bracket >= 0) {
        name.resize(static_cast<std::size_t>(bracket));
        name.erase(name.find_last_not_of(L" \t") + 1);
    }
    name = L" " + name + L" ";
    TzString value;
    std::uint32_t type = 0;
    for (int index = 0; reg.EnumValueNames(index, value, type); ++index) {
        if (type != REG_SZ) continue;
        TzString const wrapped = L" " + value;
        if (wrapped.find(L" & ") >= 0 && wrapped.find(name.c_str()) >= 0)
            return reg.GetString(value);
    }
    return {};
}

void CTzadFontMapDatabase::InitSystemLocations() {
    if (!m_sRegistryLocation.isEmpty()) return;
    m_sRegistryLocation = kFontList;
    CTwUiRegistryAccess folders;
    if (folders.Open(HKEY_CURRENT_USER, kShellFolders))
        m_sSystemFontPath = folders.GetString(L"Fonts");
}

TzString CTzadFontMapDatabase::GetSystemFontPath() {
    return m_sSystemFontPath;
}

void CTzadFontMapDatabase::PopulateDatabaseFromRegistry() {
    InitSystemLocations();
    regLocation().Open(HKEY_LOCAL_MACHINE, m_sRegistryLocation);
    TzString const product = Tzworks::Tzdraft::PAL::Settings::productRegistryKey();
    regLocationAlt().Open(HKEY_LOCAL_MACHINE, product + L"\\AltFontNames");
    HDC const device = GetDC(GetDesktopWindow());
    EnumFontFamilies(device, nullptr, &CTzadFontMapDatabase_EnumFontCallback, 0);
    ReleaseDC(GetDesktopWindow(), device);
    regLocation().Close();
    regLocationAlt().Close();
}

CStdStrW CTzadFontMapDatabase::GetFileNameFromFaceName(CStdStrW const& face) {
    CStdStrW name(face);
    if (!name.empty() && name.front() == L'@') name.erase(0, 1);
    CStdStrW file;
    if (regLocation().IsOpen()) file = regLocation().GetString(name.c_str());
    if (file.empty() && regLocationAlt().IsOpen()) file = regLocationAlt().GetString(name.c_str());
    if (file.empty()) file = SearchForTTCFile(name, regLocation());
    if (endsInFot(file)) file.replace(file.size() - 4, 4, L".ttf");
    return file;
}

CStdStrW CTzadFontMapDatabase::GetFaceNameFromFontName(CStdStrW const& /*name*/,
                                                       bool /*bold*/,
                                                       bool /*italic*/) {
    return {};
}

int CTzadFontMapDatabase_EnumFontCallback(tagENUMLOGFONTW* /*face*/,
                                          tagNEWTEXTMETRICW* /*metrics*/,
                                          int /*kind*/,
                                          long long /*userData*/) {
    return 1;
}
