#pragma once

// UTF-8 in and out, fast where a text is plain.

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace tzconvert {

// Why bytes were refused, and where.
struct BadByte {
    std::size_t offset;
    char const* reason;
};

// Decodes into `text`, which is empty before. The first byte that is no UTF-8 or is zero, if any;
// `text` then holds what stands ahead of it.
[[nodiscard]] std::optional<BadByte> decodeText(std::string_view bytes, std::wstring& text);

// Appends the UTF-8 of a text; a value that is no Unicode scalar becomes U+FFFD.
void encodeText(std::wstring_view text, std::string& bytes);

}  // namespace tzconvert
