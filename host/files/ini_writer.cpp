#include <string>

#include <SimpleIni.h>

#include "host/base/fault_point.h"
#include "host/files/file_bytes.h"
#include "host/files/ini_data.h"
#include "host/text/utf8.h"
#include "tz/pal/ini_file.h"

bool WritePrivateProfileString(wchar_t const* section,
                               wchar_t const* key,
                               wchar_t const* value,
                               wchar_t const* file) {
    if (tzhost::faultAt("WritePrivateProfileString")) return false;
    if (section == nullptr || file == nullptr) return false;
    std::string const path = tzhost::toUtf8(file);
    std::string const name = tzhost::toUtf8(section);
    std::string const keyName = tzhost::toUtf8(key ? key : L"");
    CSimpleIniA ini(true, true, false);  // UTF-8, keys more than once, values on one line
    ini.SetSpaces(false);
    std::string const old = tzhost::readFile(path).value_or("");
    if (ini.LoadData(tzhost::withEqualsSigns(old)) < 0) return false;
    if (key == nullptr) {
        ini.Delete(name.c_str(), nullptr);
    } else if (value == nullptr) {
        ini.Delete(name.c_str(), keyName.c_str());
    } else if (ini.SetValue(name.c_str(), keyName.c_str(), tzhost::toUtf8(value).c_str(), nullptr,
                            true) < 0) {
        return false;
    }
    std::string text;
    return ini.Save(text) >= 0 && tzhost::writeFileSafely(path, text);
}
