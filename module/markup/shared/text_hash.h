#pragma once

#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>

// A table by text, in which a view finds its text without a copy.
//
//   TextTable<int> table;
//   table.find(std::wstring_view(L"key"));
struct TextHash {
    using is_transparent = void;
    std::size_t operator()(std::wstring_view text) const {
        return std::hash<std::wstring_view>()(text);
    }
};
template <class Value>
using TextTable = std::unordered_map<std::wstring, Value, TextHash, std::equal_to<>>;
