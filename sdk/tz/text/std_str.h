#pragma once

#include <cstdarg>
#include <string>
#include <utility>

#include "tz/text/string.h"

// The wide string of the converters and of the font map: a standard string with the operations that
// their code uses. Indices clamp to the ends of the text; "not found" is -1.
//
//   CStdStrW key;
//   key.Fmt(L"%s|b%d", face.c_str(), 1);
//   key.MakeLower();
template <class Char = wchar_t>
class CStdStr : public std::basic_string<Char> {
public:
    using Base = std::basic_string<Char>;
    using Base::Base;

    CStdStr() = default;
    CStdStr(Base text) : Base(std::move(text)) {}
    CStdStr(TzString const& text) : Base(text.str()) {}
    // A null pointer reads as the empty text.
    CStdStr(Char const* text) : Base(text ? text : &kEnd) {}

    // Replaces this text by a formatted one; %s and %ls take wide text. Only for wide strings.
    void Fmt(Char const* format, ...) {
        va_list arguments;
        va_start(arguments, format);
        Base::operator=(tzFormatV(format, arguments));
        va_end(arguments);
    }

    [[nodiscard]] int GetLength() const { return static_cast<int>(this->size()); }
    [[nodiscard]] bool IsEmpty() const { return this->empty(); }
    [[nodiscard]] int Find(Char c, int start = 0) const {
        return static_cast<int>(this->find(c, clamp(start)));
    }
    [[nodiscard]] int Find(Char const* text, int start = 0) const {
        return static_cast<int>(this->find(text ? text : &kEnd, clamp(start)));
    }
    [[nodiscard]] int ReverseFind(Char c) const { return static_cast<int>(this->rfind(c)); }
    [[nodiscard]] int FindOneOf(Char const* set) const {
        return static_cast<int>(this->find_first_of(set ? set : &kEnd));
    }
    [[nodiscard]] CStdStr Left(int count) const { return CStdStr(this->substr(0, clamp(count))); }
    [[nodiscard]] CStdStr Right(int count) const {
        return CStdStr(this->substr(this->size() - clamp(count)));
    }
    [[nodiscard]] CStdStr Mid(int start) const { return CStdStr(this->substr(clamp(start))); }
    [[nodiscard]] CStdStr Mid(int start, int count) const {
        return CStdStr(this->substr(clamp(start), count < 0 ? 0 : static_cast<std::size_t>(count)));
    }
    CStdStr& Delete(int index, int count = 1) {
        this->erase(clamp(index), count < 0 ? 0 : static_cast<std::size_t>(count));
        return *this;
    }
    CStdStr& Insert(int index, Char const* text) {
        this->insert(clamp(index), text ? text : &kEnd);
        return *this;
    }
    // Replaces every occurrence, from the front; returns how many.
    int Replace(Char const* what, Char const* by) {
        TzString text(static_cast<Base const&>(*this));
        int const count = text.replace(what, by);
        Base::operator=(text.str());
        return count;
    }

    // By the host's table of lower case.
    CStdStr& MakeLower() {
        for (Char& c : *this)
            c = tzToLower(c);
        return *this;
    }
    [[nodiscard]] int CompareNoCase(Char const* other) const {
        return tzCompareNoCase(this->c_str(), other);
    }

private:
    static constexpr Char kEnd = 0;
    [[nodiscard]] std::size_t clamp(int index) const {
        if (index < 0) return 0;
        return static_cast<std::size_t>(index) < this->size() ? static_cast<std::size_t>(index)
                                                              : this->size();
    }
};

using CStdStrW = CStdStr<wchar_t>;
