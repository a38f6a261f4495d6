#include "host/files/json_value.h"

#include "host/text/local_text.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstddef>

namespace tzhost {
namespace {

struct Escape {
    char character;
    char letter;
};

// Characters that are written as a backslash and a letter; other control characters as \u00XX.
constexpr Escape kEscapes[] = {
    {'"', '"'}, {'\\', '\\'}, {'\b', 'b'}, {'\f', 'f'}, {'\n', 'n'}, {'\r', 'r'}, {'\t', 't'},
};

void writeCharacter(std::string& out, char c) {
    for (Escape const& escape : kEscapes) {
        if (escape.character != c) continue;
        out += '\\';
        out += escape.letter;
        return;
    }
    constexpr unsigned char kFirstPlain = 0x20;
    auto const code = static_cast<unsigned char>(c);
    if (code >= kFirstPlain) {
        out += c;
        return;
    }
    constexpr std::string_view kDigits = "0123456789abcdef";
    out += "\\u00";
    out += kDigits[code >> 4U];
    out += kDigits[code & 0xFU];
}

}  // namespace

JsonValue const* JsonValue::find(std::string_view name) const {
    auto const at = std::find_if(members.begin(), members.end(),
                                 [=](auto const& each) { return each.first == name; });
    return at == members.end() ? nullptr : &at->second;
}

std::string nameOf(JsonKind kind) {
    switch (kind) {
    case JsonKind::null: return "null";
    case JsonKind::flag: return localText("true or false");
    case JsonKind::number: return localText("a number");
    case JsonKind::text: return localText("a text");
    case JsonKind::array: return localText("an array");
    case JsonKind::object: break;
    }
    return localText("an object");
}

void writeText(std::string& out, std::string_view utf8) {
    out += '"';
    for (char const c : utf8)
        writeCharacter(out, c);
    out += '"';
}

// The negative zero is written without its sign, which a whole number would lose in reading.
void writeNumber(std::string& out, double value) {
    constexpr std::size_t kLongest = 32;
    std::array<char, kLongest> digits{};
    if (value == 0.0) value = 0.0;  // -0 too
    auto const end = std::to_chars(digits.data(), digits.data() + digits.size(), value).ptr;
    out.append(digits.data(), end);
}

// Values were read with a bound on their depth, so the calls nest no deeper.
void writeValue(std::string& out, JsonValue const& value) {
    char separator = 0;
    auto const separate = [&](char open) {
        out += separator ? separator : open;
        separator = ',';
    };
    switch (value.kind) {
    case JsonKind::null: out += "null"; break;
    case JsonKind::flag: out += value.flag ? "true" : "false"; break;
    case JsonKind::number: out += value.text; break;
    case JsonKind::text: writeText(out, value.text); break;
    case JsonKind::array:
        for (JsonValue const& item : value.items) {
            separate('[');
            writeValue(out, item);
        }
        out += separator ? "]" : "[]";
        break;
    case JsonKind::object:
        for (auto const& [name, member] : value.members) {
            separate('{');
            writeText(out, name);
            out += ':';
            writeValue(out, member);
        }
        out += separator ? "}" : "{}";
        break;
    }
}

}  // namespace tzhost
