#pragma once

#include <memory>
#include <string_view>
#include <unordered_map>

#include "tz/text/std_str.h"

// A typeface's name, shared by all that hold it: a copy is as cheap for a long name as for a short
// one, and so is a comparison of names from one pool.
//
//   FontNamePool pool;
//   FontName const a = pool.intern(L"Arial"), b = pool.intern(L"ARIAL");
//   a == b          // false
//   a.isSameAs(b)   // true, without looking at the letters
class FontName {
public:
    // The empty name.
    FontName() = default;
    FontName(CStdStrW const& text);
    FontName(wchar_t const* text) : FontName(CStdStrW(text)) {}

    [[nodiscard]] CStdStrW const& text() const;
    [[nodiscard]] bool isEmpty() const { return !text_; }
    // Equal letter by letter.
    [[nodiscard]] bool operator==(FontName const& other) const;
    // Equal but for case, by the host's table.
    [[nodiscard]] bool isSameAs(FontName const& other) const;
    // Tells names of one pool apart without looking at their letters.
    [[nodiscard]] void const* identity() const { return text_.get(); }

private:
    friend class FontNamePool;
    struct Shared {
        CStdStrW text;
        mutable std::shared_ptr<CStdStrW const> folded;  // in lower case; null until asked for
    };
    [[nodiscard]] std::shared_ptr<CStdStrW const> const& folded() const;

    std::shared_ptr<Shared const> text_;  // null for the empty name
};

// Gives equal names one object. Names outlive their pool.
class FontNamePool {
public:
    [[nodiscard]] FontName intern(CStdStrW const& text);

private:
    // Keys are views of the texts that the values hold; names that are the same but for case share
    // one in lower case.
    std::unordered_map<std::wstring_view, FontName> names_;
    std::unordered_map<std::wstring_view, std::shared_ptr<CStdStrW const>> folded_;
};
