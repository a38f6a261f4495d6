#include "apps/tzconvert/text_codec.h"

#include <algorithm>

#include "host/base/utf8.h"

namespace tzconvert {
namespace {

bool isPlainByte(char byte) {
    return static_cast<signed char>(byte) > 0;
}

bool isPlainCharacter(wchar_t c) {
    return c >= 0 && c < 0x80;
}

// Runs of plain characters are found in blocks, which the compiler looks at several at once.
constexpr std::size_t kBlock = 64;

template <class Character, class IsPlain>
std::size_t plainRun(Character const* text, std::size_t size, IsPlain isPlain) {
    std::size_t run = 0;
    while (size - run >= kBlock) {
        bool areAllPlain = true;
        for (std::size_t i = 0; i < kBlock; ++i)
            areAllPlain &= isPlain(text[run + i]);
        if (!areAllPlain) break;
        run += kBlock;
    }
    while (run < size && isPlain(text[run]))
        ++run;
    return run;
}

}  // namespace

std::optional<BadByte> decodeText(std::string_view bytes, std::wstring& text) {
    text.reserve(bytes.size());
    for (std::size_t at = 0; at < bytes.size();) {
        std::size_t const run = plainRun(bytes.data() + at, bytes.size() - at, isPlainByte);
        text.append(bytes.data() + at, bytes.data() + at + run);
        at += run;
        if (at == bytes.size()) break;
        if (bytes[at] == 0) return BadByte{at, "a zero character"};
        std::string_view const others = bytes.substr(at);
        auto const end = std::find_if(others.begin(), others.end(), [](char byte) {
            return static_cast<signed char>(byte) >= 0;
        });
        std::string_view const part =
            others.substr(0, static_cast<std::size_t>(end - others.begin()));
        if (std::size_t const bad = tzhost::firstBadByte(part); bad != tzhost::kAllUtf8)
            return BadByte{at + bad, "not UTF-8"};
        text += tzhost::fromUtf8(part);
        at += part.size();
    }
    return {};
}

void encodeText(std::wstring_view text, std::string& bytes) {
    while (!text.empty()) {
        std::size_t const run = plainRun(text.data(), text.size(), isPlainCharacter);
        std::size_t const start = bytes.size();
        bytes.resize(start + run);
        std::transform(text.begin(), text.begin() + static_cast<std::ptrdiff_t>(run),
                       bytes.begin() + static_cast<std::ptrdiff_t>(start),
                       [](wchar_t c) { return static_cast<char>(c); });
        text.remove_prefix(run);
        auto const end = std::find_if(text.begin(), text.end(), isPlainCharacter);
        auto const others = static_cast<std::size_t>(end - text.begin());
        bytes += tzhost::toUtf8(text.substr(0, others));
        text.remove_prefix(others);
    }
}

}  // namespace tzconvert
