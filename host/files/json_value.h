#pragma once

#include <string>
#include <string_view>
#include <vector>

// A JSON value that knows its line, and the one form in which this host writes JSON: without
// blanks, numbers in the shortest form that reads back the same, texts in UTF-8.
namespace tzhost {

enum class JsonKind { null, flag, number, text, array, object };

struct JsonMember;

struct JsonValue {
    JsonKind kind = JsonKind::null;
    int line = 1;
    bool flag = false;
    double number = 0.0;
    std::string text;  // of a text its UTF-8, of a number its digits as they stood in the file
    std::vector<JsonValue> items;
    std::vector<JsonMember> members;  // in file order, each name once

    // The member of that name, or null.
    [[nodiscard]] JsonValue const* find(std::string_view name) const;
};

struct JsonMember {
    std::string first;  // the name
    JsonValue second;
};

// What a kind is called in a message: "a number".
[[nodiscard]] std::string nameOf(JsonKind kind);

// Append one value each.
void writeText(std::string& out, std::string_view utf8);
void writeNumber(std::string& out, double value);
void writeValue(std::string& out, JsonValue const& value);

}  // namespace tzhost
