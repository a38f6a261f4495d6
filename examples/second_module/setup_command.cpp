// MARKSETUP: what the settings, the registry, the font map file and the text module say about texts
// and fonts.

#include "bodies.h"
#include "tz/ed/editors.h"
#include "tz/ed/print.h"
#include "tz/ed/prompts.h"
#include "tz/mte/globals.h"
#include "tz/pal/font_enumeration.h"
#include "tz/pal/ini_file.h"
#include "tz/pal/message_box.h"
#include "tz/pal/registry.h"
#include "tz/pal/settings.h"
#include "tz/text/code_page.h"
#include "tz/text/font_info.h"

namespace marks {
namespace {

namespace Settings = Tzworks::Tzdraft::PAL::Settings;

// Counts the entries of a section of the font map file.
class EntryCount : public CIniFileEnumerator {
public:
    using CIniFileEnumerator::CIniFileEnumerator;
    bool EnumeratedKey(TzString const& /*key*/) override {
        ++count;
        return true;
    }
    int count = 0;
};

int countFace(tagENUMLOGFONTW* /*face*/,
              tagNEWTEXTMETRICW* /*metrics*/,
              int /*kind*/,
              long long count) {
    ++*reinterpret_cast<int*>(count);
    return 1;
}

int countFaces() {
    int count = 0;
    HDC const device = GetDC(GetDesktopWindow());
    EnumFontFamilies(device, nullptr, countFace, reinterpret_cast<long long>(&count));
    ReleaseDC(GetDesktopWindow(), device);
    return count;
}

void tellEditors() {
    std::uint32_t pixels = 0;
    Settings::read().getProductSettings(
        L"MTEXT.IPE",
        [&](Settings::Container const& values) {
            pixels = values.getUInt32(L"MinPixelSize");
            return true;
        },
        true);
    tzutPrintf(L"\nSmallest text in the editor: %u pixels", pixels);
    tzutPrintf(L"\nEditor in place: %ls", IPEIsEditor(true) ? L"yes" : L"no");
    tzutPrintf(L"\nDialogs: %ls", tzedInitDialog(false) ? L"yes" : L"no");
    tzutPrintf(L"\nFields: %ls", g_bEnableFieldUI ? L"yes" : L"no");
    CTwUiRegistryAccess user;
    if (user.Open(HKEY_CURRENT_USER, Settings::productRegistryKey()))
        tzutPrintf(L"\nDrafter: %ls", user.GetString(L"Drafter").kwszPtr());
}

void tellFonts() {
    EntryCount strokes(GetMTextMapFilename(), gszIniSHXSectMapDatabase);
    strokes.EnumerateSection();
    CIniFile const proxies(GetMTextMapFilename(), gszIniSectProxyFiles);
    tzutPrintf(L"\nStroke fonts with a face: %d", strokes.count);
    tzutPrintf(L"\nFirst proxy: %ls", proxies.GetString(L"Proxy 1", L"none").kwszPtr());
    tzutPrintf(L"\nFaces of the machine: %d", countFaces());
    CFontInfoItem item;
    bool const known = tzFontInfo().FontInfoFromTypeFaceName(L"DejaVu Sans", item);
    tzutPrintf(L"\nDejaVu Sans: %ls", known ? item.fileName.c_str() : L"not there");
}

void tellCodePage() {
    code_page_id_ex const page = Locale::getSystemCodePageIdEx();
    std::string const bytes = UnicodeConvert::wideToMultibyte(page, L"\u00D8");
    CStdStrW back;
    bool const same = UnicodeConvert::multibyteToWide(page, bytes, back) && back == L"\u00D8";
    tzutPrintf(L"\nCode page: %d, character set %d, %ls the sign for a diameter\n", page.number(),
               static_cast<int>(TzCodePage::SysCharset()), same ? L"with" : L"without");
}

}  // namespace

void setupCommand() {
    tzedTextScr();
    tellEditors();
    tellFonts();
    tellCodePage();
    TwHostMessageBox::simple(TzString(L"Words of the text module: ") + gStringTable[1043].kwszPtr(),
                             0);
}

}  // namespace marks
