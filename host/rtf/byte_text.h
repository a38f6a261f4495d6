#pragma once

// Bytes of a code page, which come one by one, as characters.

#include <array>
#include <map>
#include <string>

namespace tzhost {

inline constexpr int kSymbolPage = 42;  // each byte is a character at U+F000

class RtfByteText {
public:
    // Whether a document may name the page. Bytes of another stand in the document's own.
    [[nodiscard]] static bool isKnown(int page);

    // The characters that a byte completes: often one, none of a lead byte. What an unfinished
    // character of another page had is given first. Bytes that are no characters are widened.
    [[nodiscard]] std::wstring add(unsigned char byte, int page);
    // Whether the next byte belongs to a character that has begun, be it escaped or not.
    [[nodiscard]] bool isOpen() const { return !bytes_.empty(); }
    // What an unfinished character had.
    [[nodiscard]] std::wstring end();

private:
    [[nodiscard]] bool isUnfinished() const;
    void usePage(int page);

    std::string bytes_;  // of the character that has begun
    int page_ = 0;
    bool hasLeadBytes_ = false;
    using Singles = std::array<wchar_t, 0x100>;
    std::map<int, Singles> tables_;     // the characters of single bytes of the pages met
    Singles const* singles_ = nullptr;  // of the page in use
};

}  // namespace tzhost
