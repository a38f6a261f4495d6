#include "host/rtf/tokens.h"

#include <algorithm>
#include <limits>

namespace tzhost {

namespace {

using Kind = RtfToken::Kind;

constexpr std::size_t kBlock = 32;

bool isLetter(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
}

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

// Without a branch, so that the compiler takes a block at once.
unsigned int isNoText(char c) {
    auto const bits = static_cast<unsigned char>(c);
    auto const isOutside =
        static_cast<unsigned int>(bits < 0x20) | static_cast<unsigned int>(bits > 0x7E);
    auto const isSign = static_cast<unsigned int>(c == '\\') | static_cast<unsigned int>(c == '{') |
                        static_cast<unsigned int>(c == '}');
    return isOutside | isSign;
}

std::size_t plainLength(std::string_view bytes) {
    std::size_t length = 0;
    for (; bytes.size() - length >= kBlock; length += kBlock) {
        unsigned int found = 0;
        for (std::size_t i = 0; i < kBlock; ++i)
            found |= isNoText(bytes[length + i]);
        if (found != 0) break;
    }
    while (length < bytes.size() && isNoText(bytes[length]) == 0)
        ++length;
    return length;
}

// -1 for a character that is no hex digit.
int hexDigit(char c) {
    if (isDigit(c)) return c - '0';
    if (c >= 'a' && c <= 'f') return c - 'a' + 10;
    if (c >= 'A' && c <= 'F') return c - 'A' + 10;
    return -1;
}

bool isLineEnd(char c) {
    return c == '\n' || c == '\r';
}

}  // namespace

std::string_view RtfTokens::take(std::size_t count) {
    std::string_view const taken = rest_.substr(0, count);
    rest_.remove_prefix(taken.size());
    return taken;
}

RtfToken RtfTokens::next() {
    while (!rest_.empty()) {
        char const c = rest_.front();
        switch (c) {
        case '{': return {Kind::open, take(1)};
        case '}': return {Kind::close, take(1)};
        case '\\': {
            (void)take(1);
            RtfToken const token = afterBackslash();
            if (token.kind != Kind::end) return token;
            break;
        }
        case '\n':
        case '\r':
        case 0: (void)take(1); break;
        default: {
            if (std::size_t const length = plainLength(rest_); length > 0)
                return {Kind::text, take(length)};
            (void)take(1);
            return {Kind::byte, {}, static_cast<unsigned char>(c)};
        }
        }
    }
    return {};
}

// `end` when nothing stands there.
RtfToken RtfTokens::afterBackslash() {
    if (rest_.empty()) return {};
    char const c = rest_.front();
    if (c >= 'a' && c <= 'z') return word();
    (void)take(1);
    if (c == '\'') return escapedByte();
    if (isLineEnd(c)) return {Kind::word, "par"};
    if (c == '\t') return {Kind::word, "tab"};
    return {Kind::symbol, std::string_view(rest_.data() - 1, 1)};
}

RtfToken RtfTokens::word() {
    auto const* const end = std::find_if_not(rest_.begin(), rest_.end(), isLetter);
    RtfToken token{Kind::word, take(static_cast<std::size_t>(end - rest_.begin()))};
    takeNumber(token);
    if (!rest_.empty() && rest_.front() == ' ') (void)take(1);
    bool const isBinary = token.text == "bin" && token.value > 0;
    if (isBinary && static_cast<std::size_t>(token.value) <= rest_.size())
        (void)take(static_cast<std::size_t>(token.value));
    return token;
}

// A hyphen without a digit after it is text.
void RtfTokens::takeNumber(RtfToken& token) {
    std::size_t const sign = !rest_.empty() && rest_.front() == '-' ? 1 : 0;
    if (rest_.size() <= sign || !isDigit(rest_[sign])) return;
    (void)take(sign);
    constexpr long long kMost = std::numeric_limits<int>::max();
    long long number = 0;
    for (; !rest_.empty() && isDigit(rest_.front()); rest_.remove_prefix(1))
        number = std::min(kMost, number * 10 + (rest_.front() - '0'));
    token.value = static_cast<int>(sign == 0 ? number : -number);
    token.hasValue = true;
}

// Line ends may stand between the digits. What is no digit is left, and no digits are no byte.
RtfToken RtfTokens::escapedByte() {
    int value = 0;
    int digits = 0;
    while (digits < 2 && !rest_.empty()) {
        char const c = rest_.front();
        int const digit = hexDigit(c);
        if (digit < 0 && !isLineEnd(c) && c != '\t') break;
        (void)take(1);
        if (digit < 0) continue;
        value = value * 16 + digit;
        ++digits;
    }
    if (digits == 0) return {};
    return {Kind::byte, {}, value};
}

}  // namespace tzhost
