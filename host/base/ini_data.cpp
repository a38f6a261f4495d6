#include "host/base/ini_data.h"

#include <algorithm>
#include <tuple>

#include <SimpleIni.h>
#include <sys/stat.h>

#include "host/base/case_table.h"
#include "host/base/file_bytes.h"
#include "host/base/utf8.h"

namespace tzhost {

namespace {

// What tells one state of a file from another: device and number, size, and time of change.
using Stamp = std::tuple<dev_t, ino_t, off_t, time_t, long>;

Stamp stampOf(std::string const& path) {
    struct stat status {};
    if (::stat(path.c_str(), &status) != 0) return {};
    return {status.st_dev, status.st_ino, status.st_size, status.st_mtim.tv_sec,
            status.st_mtim.tv_nsec};
}

struct Kept {
    Stamp stamp;
    std::shared_ptr<IniData const> data;
};

}  // namespace

std::wstring lowered(std::wstring_view text) {
    std::wstring lower(text);
    for (wchar_t& c : lower)
        c = lowerOf(c);
    return lower;
}

std::string withEqualsSigns(std::string_view bytes) {
    std::string whole;
    whole.reserve(bytes.size());
    while (!bytes.empty()) {
        std::size_t const end = std::min(bytes.find_first_of("\r\n"), bytes.size());
        std::string_view const line = bytes.substr(0, end);
        std::size_t const start = line.find_first_not_of(" \t");
        bool const isKey =
            start != line.npos && std::string_view("[;#").find(line[start]) == line.npos;
        whole += line;
        if (isKey && line.find('=') == line.npos) whole += '=';
        if (end < bytes.size()) whole += bytes[end];
        bytes.remove_prefix(std::min(end + 1, bytes.size()));
    }
    return whole;
}

IniData IniData::fromBytes(std::string_view bytes) {
    CSimpleIniA reader(true, true, false);  // UTF-8, keys more than once, values on one line
    IniData data;
    if (reader.LoadData(withEqualsSigns(bytes)) < 0) return data;
    CSimpleIniA::TNamesDepend sections;
    reader.GetAllSections(sections);
    sections.sort(CSimpleIniA::Entry::LoadOrder());
    for (CSimpleIniA::Entry const& each : sections) {
        auto const* const read = reader.GetSection(each.pItem);
        std::vector<std::pair<CSimpleIniA::Entry, char const*>> entries(read->begin(), read->end());
        std::sort(entries.begin(), entries.end(), [](auto const& a, auto const& b) {
            return CSimpleIniA::Entry::LoadOrder()(a.first, b.first);
        });
        // Sections whose names differ in case, beyond what the reader merges, are one.
        Section& section = data.sections_[lowered(fromUtf8(each.pItem))];
        for (auto const& [key, value] : entries) {
            section.rows.emplace_back(fromUtf8(key.pItem), fromUtf8(value ? value : ""));
            section.values[lowered(section.rows.back().first)] = section.rows.back().second;
        }
    }
    return data;
}

IniData::Section const* IniData::section(std::wstring_view name) const {
    auto const at = sections_.find(lowered(name));
    return at == sections_.end() ? nullptr : &at->second;
}

std::shared_ptr<IniData const> openIni(std::string const& path) {
    static std::map<std::string, Kept> cache;
    Stamp const stamp = stampOf(path);
    auto const at = cache.find(path);
    if (at != cache.end() && at->second.stamp == stamp) return at->second.data;
    auto const bytes = readFile(path);
    auto data = std::make_shared<IniData const>(IniData::fromBytes(bytes.value_or("")));
    cache.insert_or_assign(path, Kept{stamp, data});
    return data;
}

}  // namespace tzhost
