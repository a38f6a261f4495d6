#pragma once

// Bodies of the small operations of TzString; included by tz/text/string.h alone.

#include "tz/text/string.h"

inline std::size_t TzString::clamp(int index) const {
    return index < 0 ? 0 : static_cast<std::size_t>(index < length() ? index : length());
}

inline wchar_t TzString::getAt(int index) const {
    return index < 0 || index >= length() ? L'\0' : text_[static_cast<std::size_t>(index)];
}

inline TzString& TzString::setEmpty() {
    text_.clear();
    return *this;
}

inline int TzString::find(wchar_t c, int start) const {
    return static_cast<int>(text_.find(c, clamp(start)));
}

inline int TzString::find(wchar_t const* text, int start) const {
    return static_cast<int>(text_.find(text ? text : L"", clamp(start)));
}

inline int TzString::findLast(wchar_t c) const {
    return static_cast<int>(text_.rfind(c));
}

inline int TzString::findOneOf(wchar_t const* set, int start) const {
    return static_cast<int>(text_.find_first_of(set ? set : L"", clamp(start)));
}

inline TzString TzString::right(int count) const {
    return mid(length() - static_cast<int>(clamp(count)), length());
}

inline TzString TzString::mid(int start, int count) const {
    return TzString(text_.substr(clamp(start), count < 0 ? 0 : static_cast<std::size_t>(count)));
}

inline TzString& TzString::append(wchar_t const* text) {
    text_ += text ? text : L"";
    return *this;
}

inline TzString& TzString::append(wchar_t c) {
    text_ += c;
    return *this;
}

inline TzString& TzString::insert(int index, wchar_t const* text) {
    text_.insert(clamp(index), text ? text : L"");
    return *this;
}

inline TzString& TzString::remove(int index, int count) {
    text_.erase(clamp(index), count < 0 ? 0 : static_cast<std::size_t>(count));
    return *this;
}

inline int TzString::replace(wchar_t const* what, wchar_t const* by) {
    std::wstring_view const from(what ? what : L"");
    std::wstring_view const to(by ? by : L"");
    if (from.empty()) return 0;
    std::wstring result;
    int count = 0;
    std::size_t start = 0;
    for (std::size_t at; (at = text_.find(from, start)) != std::wstring::npos; ++count) {
        result.append(text_, start, at - start).append(to);
        start = at + from.size();
    }
    if (count > 0) text_ = result.append(text_, start, std::wstring::npos);
    return count;
}

inline int TzString::compare(wchar_t const* other) const {
    return text_.compare(other ? other : L"");
}

inline TzString& TzString::trimLeft(wchar_t const* set) {
    text_.erase(0, text_.find_first_not_of(set ? set : L""));
    return *this;
}

inline TzString& TzString::trimRight(wchar_t const* set) {
    text_.erase(text_.find_last_not_of(set ? set : L"") + 1);
    return *this;
}
