#pragma once

// INI files as the host keeps them in memory; tz/pal/ini_file.h says how they are read.

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

namespace tzhost {

class IniData {
public:
    // The keys and values of a section as written, in the order of the file.
    using Rows = std::vector<std::pair<std::wstring, std::wstring>>;

    struct Section {
        Rows rows;
        std::unordered_map<std::wstring, std::wstring>
            values;  // by key in lower case, the last of each
    };

    // Reads the bytes of a file.
    [[nodiscard]] static IniData fromBytes(std::string_view bytes);

    // Null when there is no such section. Valid as long as this object. A section is read when it
    // is first asked for, since most of a long file may never be needed. Not thread-safe.
    [[nodiscard]] Section const* section(std::wstring_view name) const;

private:
    struct Source;
    std::shared_ptr<Source const> source_;              // the file as its reader has it; never null
    mutable std::map<std::wstring, Section> sections_;  // by name in lower case
};

// The data of the file, which is read again when it has changed. Empty for a file that cannot be
// read; never null.
[[nodiscard]] std::shared_ptr<IniData const> openIni(std::string const& path);

// The bytes with an equals sign after each key that stands alone. Without it the file reader gives
// such a key the value of the previous line.
[[nodiscard]] std::string withEqualsSigns(std::string_view bytes);

// Text in lower case, by the host's table.
[[nodiscard]] std::wstring lowered(std::wstring_view text);

}  // namespace tzhost
