#include "host/text/utf8.h"

#include <cstdint>
#include <cstring>

#include "tz/text/string.h"

namespace tzhost {

namespace {

constexpr wchar_t kReplacement = 0xFFFD;
constexpr wchar_t kLastScalar = 0x10FFFF;

bool isSurrogate(wchar_t c) {
    return c >= 0xD800 && c <= 0xDFFF;
}

struct Decoded {
    wchar_t c;
    std::size_t size;  // 0: no character stands here
};

// The character at the start of `bytes`, which is not empty.
Decoded decode(std::string_view bytes) {
    auto const lead = static_cast<unsigned char>(bytes[0]);
    if (lead < 0x80) return {static_cast<wchar_t>(lead), 1};
    std::size_t const size = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : 2;
    if (lead < 0xC2 || lead > 0xF4 || bytes.size() < size) return {0, 0};
    wchar_t c = lead & (0xFF >> (size + 1));
    for (std::size_t i = 1; i < size; ++i) {
        auto const next = static_cast<unsigned char>(bytes[i]);
        if ((next & 0xC0) != 0x80) return {0, 0};
        c = (c << 6) | (next & 0x3F);
    }
    constexpr wchar_t kLeast[] = {0, 0, 0x80, 0x800, 0x10000};
    if (c < kLeast[size] || c > kLastScalar || isSurrogate(c)) return {0, 0};
    return {c, size};
}

// How many of the first bytes are ASCII, by eights but for the last ones.
std::size_t asciiAtStart(std::string_view bytes) {
    constexpr std::uint64_t kHighBits = 0x8080808080808080;
    std::size_t at = 0;
    for (std::uint64_t eight; at + sizeof eight <= bytes.size(); at += sizeof eight) {
        std::memcpy(&eight, bytes.data() + at, sizeof eight);
        if ((eight & kHighBits) != 0) break;
    }
    while (at < bytes.size() && static_cast<unsigned char>(bytes[at]) < 0x80)
        ++at;
    return at;
}

void encode(wchar_t c, std::string& bytes) {
    auto const tail = [&bytes](int value) { bytes += static_cast<char>(0x80 | (value & 0x3F)); };
    if (c < 0x80) {
        bytes += static_cast<char>(c);
    } else if (c < 0x800) {
        bytes += static_cast<char>(0xC0 | (c >> 6));
        tail(c);
    } else if (c < 0x10000) {
        bytes += static_cast<char>(0xE0 | (c >> 12));
        tail(c >> 6);
        tail(c);
    } else {
        bytes += static_cast<char>(0xF0 | (c >> 18));
        tail(c >> 12);
        tail(c >> 6);
        tail(c);
    }
}

}  // namespace

std::size_t firstBadByte(std::string_view bytes) {
    for (std::size_t at = asciiAtStart(bytes); at < bytes.size();) {
        std::size_t const size = decode(bytes.substr(at)).size;
        if (size == 0) return at;
        at += size;
        at += asciiAtStart(bytes.substr(at));
    }
    return kAllUtf8;
}

std::wstring fromUtf8(std::string_view bytes) {
    std::size_t const plain = asciiAtStart(bytes);
    std::wstring text(bytes.begin(), bytes.begin() + plain);
    if (plain == bytes.size()) return text;
    text.reserve(bytes.size());
    for (std::size_t at = plain; at < bytes.size();) {
        Decoded const next = decode(bytes.substr(at));
        text += next.size == 0 ? kReplacement : next.c;
        at += next.size == 0 ? 1 : next.size;
    }
    return text;
}

std::string toUtf8(std::wstring_view text) {
    std::string bytes;
    bytes.reserve(text.size());
    for (wchar_t const c : text) {
        encode(c < 0 || c > kLastScalar || isSurrogate(c) ? kReplacement : c, bytes);
    }
    return bytes;
}

}  // namespace tzhost

TzString TzString::fromUtf8(std::string_view bytes) {
    return TzString(tzhost::fromUtf8(bytes));
}

std::string TzString::toUtf8() const {
    return tzhost::toUtf8(text_);
}
