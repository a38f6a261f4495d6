#pragma once

#include <array>
#include <cstddef>
#include <string_view>

// A longer run of plain characters is copied in pieces of this length: a piece that was just looked
// through is still in the cache when it is copied.
inline constexpr std::ptrdiff_t kLongestRun = 2048;

// Some of the characters below 128, looked up at once: the loops over plain text ask about each of
// theirs.
class AsciiSet {
public:
    // characters: all of them below 128.
    constexpr explicit AsciiSet(std::wstring_view characters) {
        for (wchar_t const c : characters)
            has_[static_cast<std::size_t>(c)] = true;
    }

    // False for every character from 128 on.
    [[nodiscard]] constexpr bool has(wchar_t c) const {
        return isAscii(c) && has_[static_cast<std::size_t>(c)];
    }
    [[nodiscard]] static constexpr bool isAscii(wchar_t c) {
        return static_cast<std::size_t>(c) < kAsciiEnd;
    }

private:
    static constexpr std::size_t kAsciiEnd = 128;
    std::array<bool, kAsciiEnd> has_{};
};
