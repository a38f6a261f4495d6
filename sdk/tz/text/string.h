#pragma once

#include <cstdarg>
#include <cstddef>
#include <string>
#include <string_view>

#include "tz/export.h"

// The host's text value: wide characters of 32 bits (one Unicode scalar each), copied by value.
//
//   TzString text = TzString::formatted(L"%s has %d lines", name.kwszPtr(), 3);
//   if (text.find(L'|') != -1) ...
//
// Indices and lengths count characters from 0; "not found" is -1. An index outside the text is
// clamped to its ends, so no operation of this class fails but for memory. `format` and its kin
// take wide text for both %s and %ls and follow no locale.
class TzString {
public:
    TzString() = default;
    // A null pointer reads as the empty text.
    TzString(wchar_t const* text) : text_(text ? text : L"") {}
    TzString(std::wstring text) : text_(std::move(text)) {}
    explicit TzString(std::wstring_view text) : text_(text) {}
    explicit TzString(wchar_t c) : text_(1, c) {}

    // The characters, terminated by zero; valid until the next change or the end of this object.
    [[nodiscard]] wchar_t const* kwszPtr() const { return text_.c_str(); }
    operator wchar_t const*() const { return text_.c_str(); }
    [[nodiscard]] std::wstring const& str() const { return text_; }

    [[nodiscard]] int length() const { return static_cast<int>(text_.size()); }
    [[nodiscard]] bool isEmpty() const { return text_.empty(); }
    // The character at `index`, or 0 outside the text.
    [[nodiscard]] wchar_t getAt(int index) const;
    TzString& setEmpty();

    // Replaces this text by a formatted one, as printf does; returns this text.
    TZ_API TzString& format(wchar_t const* format, ...);
    TZ_API TzString& formatV(wchar_t const* format, va_list arguments);
    // The formatted text as a new value.
    [[nodiscard]] static TZ_API TzString formatted(wchar_t const* format, ...);

    // The first index at or after `start` of a character or text, or -1.
    [[nodiscard]] int find(wchar_t c, int start = 0) const;
    [[nodiscard]] int find(wchar_t const* text, int start = 0) const;
    [[nodiscard]] int findLast(wchar_t c) const;
    // The first index at or after `start` of any character of `set`, or -1.
    [[nodiscard]] int findOneOf(wchar_t const* set, int start = 0) const;

    // Parts of the text; counts reach at most to its end.
    [[nodiscard]] TzString left(int count) const { return mid(0, count); }
    [[nodiscard]] TzString right(int count) const;
    [[nodiscard]] TzString mid(int start) const { return mid(start, length()); }
    [[nodiscard]] TzString mid(int start, int count) const;

    TzString& append(wchar_t const* text);
    TzString& append(wchar_t c);
    TzString& insert(int index, wchar_t const* text);
    TzString& remove(int index, int count = 1);
    // Replaces every occurrence, from the front, without looking at what it put in; returns how
    // many.
    int replace(wchar_t const* what, wchar_t const* by);
    TzString& operator+=(TzString const& text) { return append(text.kwszPtr()); }
    TzString& operator+=(wchar_t const* text) { return append(text); }
    TzString& operator+=(wchar_t c) { return append(c); }

    // Below, equal to or above 0, by code value; the second form by the host's table of lower case.
    [[nodiscard]] int compare(wchar_t const* other) const;
    [[nodiscard]] TZ_API int compareNoCase(wchar_t const* other) const;
    TZ_API TzString& makeLower();
    TZ_API TzString& makeUpper();
    TzString& trimLeft(wchar_t const* set = L" \t\r\n");
    TzString& trimRight(wchar_t const* set = L" \t\r\n");

    // UTF-8 both ways. Bytes that are no UTF-8 read as U+FFFD each; values that are no Unicode
    // scalar are written as U+FFFD.
    [[nodiscard]] static TZ_API TzString fromUtf8(std::string_view bytes);
    [[nodiscard]] TZ_API std::string toUtf8() const;

private:
    [[nodiscard]] std::size_t clamp(int index) const;

    std::wstring text_;
};

[[nodiscard]] inline TzString operator+(TzString left, TzString const& right) {
    return left += right;
}
[[nodiscard]] inline TzString operator+(TzString left, wchar_t const* right) {
    return left += right;
}
[[nodiscard]] inline TzString operator+(wchar_t const* left, TzString const& right) {
    return TzString(left) += right;
}
[[nodiscard]] inline bool operator==(TzString const& a, TzString const& b) {
    return a.str() == b.str();
}
[[nodiscard]] inline bool operator==(TzString const& a, wchar_t const* b) {
    return a.compare(b) == 0;
}
[[nodiscard]] inline bool operator!=(TzString const& a, TzString const& b) {
    return !(a == b);
}
[[nodiscard]] inline bool operator!=(TzString const& a, wchar_t const* b) {
    return !(a == b);
}
[[nodiscard]] inline bool operator<(TzString const& a, TzString const& b) {
    return a.str() < b.str();
}

// The host's one table of lower case, the same on every machine and under every locale; characters
// without a lower case come back as they are.
[[nodiscard]] TZ_API wchar_t tzToLower(wchar_t c);
[[nodiscard]] TZ_API wchar_t tzToUpper(wchar_t c);
// Compares by that table: below, equal to or above 0. Null reads as the empty text.
[[nodiscard]] TZ_API int tzCompareNoCase(wchar_t const* a, wchar_t const* b);
// The formatted text; %s and %ls take wide text. A format that cannot be read gives what was
// written up to the fault.
[[nodiscard]] TZ_API std::wstring tzFormatV(wchar_t const* format, va_list arguments);

#include "tz/text/string_inline.h"
