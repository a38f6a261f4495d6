#pragma once

#include <string>
#include <string_view>

#include "tz/text/charset.h"
#include "tz/text/std_str.h"

// A key of the font tables: lower case, in pieces. One is built on every look-up, so a key of the
// usual length takes no memory of its own.
//
//   TableKey key;
//   key.add(face);
//   auto const at = table.find(key.view());
class TableKey {
public:
    void add(std::wstring_view text);
    void add(int number);
    // Valid until the next change of the key.
    [[nodiscard]] std::wstring_view view() const;

private:
    static constexpr std::size_t kShort = 80;

    wchar_t short_[kShort];  // the key while it fits
    std::size_t size_ = 0;   // of what short_ holds
    std::wstring long_;      // the key once it is too long for short_; else empty
};

// Lower case in place, by the same table as CStdStr::MakeLower but without a call for each letter.
void lowerKey(CStdStrW& key);

// The description of a face, as BuildFontDescription words it.
[[nodiscard]] TableKey
descriptionKey(std::wstring_view face, bool bold, bool italic, Charset charset, int pitch);
