#include "apps/tzconvert/text_codec.h"

#include <algorithm>
#include <array>

#include "apps/tzconvert/program_texts.h"
#include "host/text/utf8.h"

namespace tzconvert {
namespace {

// Characters that are one byte in both forms are converted in blocks, whose fixed size lets the
// compiler take several at once, and by way of a buffer, so that no target is filled twice.
constexpr std::size_t kBlock = 64;
constexpr std::size_t kBuffer = 16 * kBlock;

bool isPlain(char byte) {
    return static_cast<signed char>(byte) > 0;
}

bool isPlain(wchar_t c) {
    return c >= 0 && c < 0x80;
}

// Without a branch, for zero and the bytes above 0x7F have this bit alone.
unsigned int oddBits(char byte) {
    auto const bits = static_cast<unsigned char>(byte);
    return (bits | (bits - 1U)) & 0x80U;
}

unsigned int oddBits(wchar_t c) {
    return static_cast<unsigned int>(c) & ~0x7FU;
}

// Converts the plain characters at the front and returns how many they were.
template <class From, class To>
std::size_t convertPlain(std::basic_string_view<From> from, std::array<To, kBuffer>& to) {
    std::size_t const most = std::min(from.size(), kBuffer);
    std::size_t done = 0;
    for (; most - done >= kBlock; done += kBlock) {
        unsigned int odd = 0;
        for (std::size_t i = 0; i < kBlock; ++i)
            odd |= oddBits(from[done + i]);
        if (odd != 0) break;
        for (std::size_t i = 0; i < kBlock; ++i)
            to[done + i] = static_cast<To>(from[done + i]);
    }
    for (; done < most && isPlain(from[done]); ++done)
        to[done] = static_cast<To>(from[done]);
    return done;
}

template <class From, class To>
std::basic_string_view<From> appendPlain(std::basic_string_view<From> from,
                                         std::basic_string<To>& to) {
    std::array<To, kBuffer> buffer;
    for (std::size_t done = kBuffer; done == kBuffer;) {
        done = convertPlain(from, buffer);
        to.append(buffer.data(), done);
        from.remove_prefix(done);
    }
    return from;
}

// The bytes at the front that belong to characters of several.
std::string_view longBytes(std::string_view bytes) {
    auto const end = std::find_if(bytes.begin(), bytes.end(),
                                  [](char byte) { return static_cast<signed char>(byte) >= 0; });
    return bytes.substr(0, static_cast<std::size_t>(end - bytes.begin()));
}

// Whether more bytes could make a character of these, of which the first is no character's.
bool isCutOff(std::string_view bytes) {
    auto const lead = static_cast<unsigned char>(bytes[0]);
    std::size_t const size = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : 2;
    return lead >= 0xC2 && lead <= 0xF4 && bytes.size() < size &&
           std::all_of(bytes.begin() + 1, bytes.end(),
                       [](char byte) { return (byte & 0xC0) == 0x80; });
}

}  // namespace

Decoded decodeText(std::string_view bytes, std::wstring& text) {
    for (std::string_view rest = bytes;;) {
        rest = appendPlain(rest, text);
        if (rest.empty()) return {bytes.size(), nullptr};
        std::size_t const at = bytes.size() - rest.size();
        if (rest[0] == 0) return {at, forLocalText("a zero character")};
        std::string_view const part = longBytes(rest);
        std::size_t const good = std::min(tzhost::firstBadByte(part), part.size());
        text += tzhost::fromUtf8(part.substr(0, good));
        if (good < part.size()) {
            bool const isAtTheEnd = part.size() == rest.size();
            bool const isOpen = isAtTheEnd && isCutOff(part.substr(good));
            return {at + good, isOpen ? nullptr : kNotUtf8};
        }
        rest.remove_prefix(good);
    }
}

void encodeText(std::wstring_view text, std::string& bytes) {
    for (text = appendPlain(text, bytes); !text.empty(); text = appendPlain(text, bytes)) {
        auto const* const end =
            std::find_if(text.begin(), text.end(), [](wchar_t c) { return isPlain(c); });
        auto const others = static_cast<std::size_t>(end - text.begin());
        bytes += tzhost::toUtf8(text.substr(0, others));
        text.remove_prefix(others);
    }
}

}  // namespace tzconvert
