#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

// A JSON value that knows its line, and the one form in which this host writes JSON: without
// blanks, numbers in the shortest form that reads back the same, texts in UTF-8.
namespace tzhost {

enum class JsonKind : std::uint8_t { null, flag, number, text, array, object };

// Values one after the other in a store.
template <class T>
class JsonList {
public:
    JsonList() = default;
    JsonList(T const* first, std::size_t count) : first_(first), count_(count) {}

    [[nodiscard]] T const* begin() const { return first_; }
    [[nodiscard]] T const* end() const { return first_ + count_; }
    [[nodiscard]] std::size_t size() const { return count_; }
    [[nodiscard]] T const& operator[](std::size_t index) const { return first_[index]; }

private:
    T const* first_ = nullptr;
    std::size_t count_ = 0;
};

struct JsonMember;

// What it names, texts too, lies in a store (host/files/json_store.h) and is gone with it.
struct JsonValue {
    JsonKind kind = JsonKind::null;
    bool flag = false;
    int line = 1;
    double number = 0.0;
    std::string_view text;  // of a text its UTF-8, of a number its digits as they stood in the file
    JsonList<JsonValue> items;
    JsonList<JsonMember> members;  // in file order, each name once

    // The member of that name, or null.
    [[nodiscard]] JsonValue const* find(std::string_view name) const;
};

struct JsonMember {
    std::string_view first;  // the name
    JsonValue second;
};

// What a kind is called in a message: "a number".
[[nodiscard]] std::string nameOf(JsonKind kind);

// Append one value each.
void writeText(std::string& out, std::string_view utf8);
void writeNumber(std::string& out, double value);
void writeValue(std::string& out, JsonValue const& value);

}  // namespace tzhost
