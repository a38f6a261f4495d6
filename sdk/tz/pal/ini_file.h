#pragma once

#include <memory>
#include <vector>

#include "tz/export.h"
#include "tz/text/string.h"

// INI files in UTF-8: sections in brackets, and key=value lines in them. Names count without case.
// Blanks around key and value are dropped, everything else after the first "=" is the value. A
// comment opens with ";" or "#" at the start of a line only. A key written twice is met twice in an
// enumeration, and reading it gives the last value.
//
//   CIniFile file(path, L"Proxy Fonts");
//   TzString const face = file.GetString(L"Proxy 1", L"");
//
// What was read is kept until the file changes. A missing or unreadable file has no keys. [any]
class TZ_API CIniFile {
public:
    // One section of a file.
    CIniFile(TzString const& file, TzString const& section);
    virtual ~CIniFile();
    CIniFile(CIniFile const&) = delete;
    CIniFile& operator=(CIniFile const&) = delete;

    [[nodiscard]] TzString GetString(wchar_t const* key, wchar_t const* otherwise) const;
    // The value's leading digits, as ms_wtoi reads them.
    [[nodiscard]] int GetInt(wchar_t const* key, int otherwise) const;

protected:
    // The section's keys, spelt as in the file and in the order of the file.
    [[nodiscard]] std::vector<TzString> keys() const;

private:
    struct Section;
    std::shared_ptr<Section const> section_;
};

// Walks over the keys of a section.
class TZ_API CIniFileEnumerator : public CIniFile {
public:
    using CIniFile::CIniFile;

    // Calls EnumeratedKey for each key until it gives false. False then, true at the end.
    bool EnumerateSection();
    // Called for each key; false ends the walk.
    virtual bool EnumeratedKey(TzString const& key) = 0;
};

// [any] Writes one value into a file; a null value removes the key, a null key the section. False
// when the file cannot be written, which is then as it was.
TZ_API bool WritePrivateProfileString(wchar_t const* section,
                                      wchar_t const* key,
                                      wchar_t const* value,
                                      wchar_t const* file);

// [any] The full path of the font map file.
[[nodiscard]] TZ_API TzString GetMTextMapFilename();

// [any] The number that a text begins with: blanks, a sign, digits. 0 without digits; one that does
// not fit wraps to 32 bits. Null gives 0.
[[nodiscard]] TZ_API int ms_wtoi(wchar_t const* text);
