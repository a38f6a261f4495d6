#include "host/files/ini_data.h"

#include <algorithm>
#include <tuple>

#include <SimpleIni.h>
#include <sys/stat.h>

#include "host/files/file_bytes.h"
#include "host/text/case_table.h"
#include "host/text/utf8.h"

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
    whole.reserve(bytes.size() + 1);
    std::size_t feed = 0;  // where the next line feed stands, looked for once
    for (std::size_t at = 0; at < bytes.size();) {
        if (feed <= at) feed = std::min(bytes.find('\n', at), bytes.size());
        std::string_view line = bytes.substr(at, feed - at);
        line = line.substr(0, line.find('\r'));
        std::size_t const start = line.find_first_not_of(" \t");
        bool const isKey =
            start != line.npos && std::string_view("[;#").find(line[start]) == line.npos;
        whole += line;
        if (isKey && line.find('=') == line.npos) whole += '=';
        at += line.size();
        if (at < bytes.size()) whole += bytes[at++];
    }
    return whole;
}

struct IniData::Source {
    CSimpleIniA reader{true, true, false};  // UTF-8, keys more than once, values on one line
};

IniData IniData::fromBytes(std::string_view bytes) {
    auto source = std::make_shared<Source>();
    if (source->reader.LoadData(withEqualsSigns(bytes)) < 0) source->reader.Reset();
    IniData data;
    data.source_ = std::move(source);
    return data;
}

namespace {

// Adds what the reader has under one spelling of a section's name.
void addRows(IniData::Section& section, CSimpleIniA::TKeyVal const& read) {
    std::vector<std::pair<CSimpleIniA::Entry, char const*>> entries(read.begin(), read.end());
    std::sort(entries.begin(), entries.end(), [](auto const& a, auto const& b) {
        return CSimpleIniA::Entry::LoadOrder()(a.first, b.first);
    });
    for (auto const& [key, value] : entries) {
        section.rows.emplace_back(fromUtf8(key.pItem), fromUtf8(value ? value : ""));
        section.values[lowered(section.rows.back().first)] = section.rows.back().second;
    }
}

}  // namespace

IniData::Section const* IniData::section(std::wstring_view name) const {
    std::wstring const key = lowered(name);
    if (auto const at = sections_.find(key); at != sections_.end()) return &at->second;
    CSimpleIniA::TNamesDepend names;
    source_->reader.GetAllSections(names);
    names.sort(CSimpleIniA::Entry::LoadOrder());
    Section* section = nullptr;
    // Sections whose names differ in case, beyond what the reader merges, are one.
    for (CSimpleIniA::Entry const& each : names) {
        if (lowered(fromUtf8(each.pItem)) != key) continue;
        section = &sections_[key];
        addRows(*section, *source_->reader.GetSection(each.pItem));
    }
    return section;
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
