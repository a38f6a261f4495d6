// Reads any bytes as an INI file. Holds when each section's values are those of its last rows, and
// no more text came out than went in.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <unordered_map>

#include "host/files/ini_data.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::string const bytes(data, data + size);
    tzhost::IniData const ini = tzhost::IniData::fromBytes(bytes);
    std::size_t length = 0;
    for (wchar_t const* const name : {L"", L"a", L"SHX Map", L"Proxy Fonts"}) {
        tzhost::IniData::Section const* const section = ini.section(name);
        if (section == nullptr) continue;
        std::unordered_map<std::wstring, std::wstring> last;
        for (auto const& [key, value] : section->rows) {
            length += key.size() + value.size();
            last[tzhost::lowered(key)] = value;
        }
        if (last != section->values) std::abort();
    }
    if (length > size) std::abort();
    return 0;
}
