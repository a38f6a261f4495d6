#pragma once

#include <string>

#include "tz/export.h"
#include "tz/text/charset.h"
#include "tz/text/std_str.h"

// Code pages: what the bytes of old texts and fonts mean.
//
//   code_page_id const page = TzCodePage::CharSetToCodePageId(kShiftJisCharset);
//   CStdStrW text;
//   if (!UnicodeConvert::multibyteToWide(page, bytes, text)) ...
//
// A page that the host does not know, and 65001, decode as the system page, that is the page at the
// end of the variable SYSCODEPAGE. Nothing here fails but where an operation says so. [any]

// A code page by its number; any number may stand here.
enum code_page_id : int {
    kCodePageUnknown = 0,
    kCodePage932 = 932,
    kCodePage936 = 936,
    kCodePage949 = 949,
    kCodePage950 = 950,
    kCodePage1252 = 1252,
    kCodePage1361 = 1361,
    kCodePageUtf8 = 65001,
};

// A code page as the converters pass it about: from the enumeration, from a plain number, and back.
class code_page_id_ex {
public:
    code_page_id_ex() = default;
    code_page_id_ex(code_page_id page) : number_(page) {}
    code_page_id_ex(int number) : number_(number) {}

    [[nodiscard]] int number() const { return number_; }
    operator code_page_id() const { return static_cast<code_page_id>(number_); }

private:
    int number_ = kCodePageUnknown;
};

class TZ_API TzCodePage {
public:
    // The character set of the system page.
    [[nodiscard]] static Charset SysCharset();
    // The page of a character set; the system page for set 1 and for a set without a page.
    [[nodiscard]] static code_page_id CharSetToCodePageId(Charset charset);
    // The character set of a page; 0 for a page without one.
    [[nodiscard]] static Charset CodePageIdToCharSet(code_page_id page);
};

class TZ_API TzCharacterCheck {
public:
    // Whether a byte opens a character of two bytes: only in the pages 932, 936, 949, 950 and 1361.
    [[nodiscard]] static bool IsLeadByte(code_page_id page, unsigned char byte);
};

namespace UnicodeConvert {
// Decodes bytes. False, with `text` empty, when the page has no such characters.
[[nodiscard]] TZ_API bool
multibyteToWide(code_page_id_ex page, std::string const& bytes, CStdStrW& text);
// Encodes text; a character that the page lacks becomes "?".
[[nodiscard]] TZ_API std::string wideToMultibyte(code_page_id_ex page, std::wstring const& text);
}  // namespace UnicodeConvert

namespace Locale {
// The system page.
[[nodiscard]] TZ_API code_page_id_ex getSystemCodePageIdEx();
}  // namespace Locale

// Whether a `\U+XXXX` stands at `text`: a backslash, U or u, a plus sign and four hex digits of
// either case. `code` takes the digits' value, or 0.
TZ_API bool getCIF(wchar_t const* text, int& code);
[[nodiscard]] TZ_API bool getCIF(wchar_t const* text);
// Whether a `\M+nXXXX` stands at `text`: a backslash, M or m, a plus sign, a digit from 1 to 5 and
// four hex digits of either case. `page` takes what the digit stands for (932, 936, 949, 950, 1361)
// and `code` the one or two bytes of the character; without one both take 0.
TZ_API bool getMIF(wchar_t const* text, code_page_id& page, int& code);
[[nodiscard]] TZ_API bool getMIF(wchar_t const* text);
