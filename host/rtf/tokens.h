#pragma once

// The bytes of a rich text document as braces, control words, symbols and text. Any bytes are
// taken; line ends and zero bytes are stepped over.
//
//   RtfTokens tokens(document);
//   for (RtfToken token = tokens.next(); token.kind != RtfToken::Kind::end; token = tokens.next())
//       take(token);

#include <cstddef>
#include <string_view>

namespace tzhost {

struct RtfToken {
    enum class Kind {
        end,
        open,
        close,
        word,    // `text` is its letters, of which the first is a small one
        symbol,  // `text` is the character after the backslash
        text,    // `text` is a run of plain ASCII
        byte,  // `value` is a byte of a code page, escaped or as it stands, or a control character
    };
    Kind kind = Kind::end;
    std::string_view text;
    int value = 0;
    bool hasValue = false;  // a word has a number

    // The number of a word, or what it stands for without one.
    [[nodiscard]] int valueOr(int other) const { return hasValue ? value : other; }
};

class RtfTokens {
public:
    // The document must outlive this object.
    explicit RtfTokens(std::string_view document) : rest_(document) {}

    // Numbers that do not fit are the nearest int. What `\bin` announces is stepped over, unless
    // the document ends before it does: then it is read on.
    [[nodiscard]] RtfToken next();

private:
    [[nodiscard]] RtfToken afterBackslash();
    [[nodiscard]] RtfToken word();
    [[nodiscard]] RtfToken escapedByte();
    void takeNumber(RtfToken& token);
    [[nodiscard]] std::string_view take(std::size_t count);

    std::string_view rest_;
};

}  // namespace tzhost
