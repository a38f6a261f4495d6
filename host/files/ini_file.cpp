#include "tz/pal/ini_file.h"

#include "host/files/ini_data.h"

struct CIniFile::Section {
    std::shared_ptr<tzhost::IniData const> data;  // keeps `rows` alive
    tzhost::IniData::Section const* rows;         // null: no such section
};

CIniFile::CIniFile(TzString const& file, TzString const& section) {
    auto data = tzhost::openIni(file.toUtf8());
    auto const* const rows = data->section(section.str());
    section_ = std::make_shared<Section const>(Section{std::move(data), rows});
}

CIniFile::~CIniFile() = default;

TzString CIniFile::GetString(wchar_t const* key, wchar_t const* otherwise) const {
    if (key == nullptr || section_->rows == nullptr) return otherwise;
    auto const& values = section_->rows->values;
    auto const at = values.find(tzhost::lowered(key));
    return at == values.end() ? TzString(otherwise) : TzString(at->second);
}

int CIniFile::GetInt(wchar_t const* key, int otherwise) const {
    if (key == nullptr || section_->rows == nullptr) return otherwise;
    auto const& values = section_->rows->values;
    auto const at = values.find(tzhost::lowered(key));
    return at == values.end() ? otherwise : ms_wtoi(at->second.c_str());
}

std::vector<TzString> CIniFile::keys() const {
    std::vector<TzString> names;
    if (section_->rows == nullptr) return names;
    for (auto const& [key, value] : section_->rows->rows)
        names.emplace_back(key);
    return names;
}

bool CIniFileEnumerator::EnumerateSection() {
    for (TzString const& key : keys()) {
        if (!EnumeratedKey(key)) return false;
    }
    return true;
}

int ms_wtoi(wchar_t const* text) {
    if (text == nullptr) return 0;
    while (*text == L' ' || (*text >= L'\t' && *text <= L'\r'))
        ++text;
    bool const isNegative = *text == L'-';
    if (isNegative || *text == L'+') ++text;
    unsigned int value = 0;
    for (; *text >= L'0' && *text <= L'9'; ++text) {
        value = value * 10 + static_cast<unsigned int>(*text - L'0');
    }
    return static_cast<int>(isNegative ? 0U - value : value);
}
