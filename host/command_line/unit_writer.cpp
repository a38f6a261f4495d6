#include "host/command_line/unit_writer.h"

#include <charconv>
#include <cmath>
#include <cstdint>
#include <numeric>

namespace tzhost {

namespace {

constexpr std::size_t kLongestFixed = 352;  // the largest double with eight decimals and a sign

void appendWithoutMinusZero(std::string& text, char const* from, char const* to) {
    std::string_view digits(from, static_cast<std::size_t>(to - from));
    if (digits.find_first_of("123456789") == std::string_view::npos && digits.front() == '-') {
        digits.remove_prefix(1);
    }
    text += digits;
}

}  // namespace

void writeFixed(std::string& text, double value, int decimals) {
    char digits[kLongestFixed];
    auto const result =
        std::to_chars(digits, digits + kLongestFixed, value, std::chars_format::fixed, decimals);
    appendWithoutMinusZero(text, digits, result.ptr);
}

void writeScientific(std::string& text, double value, int decimals) {
    char digits[kLongestFixed];
    auto const result = std::to_chars(digits, digits + kLongestFixed, value == 0 ? 0.0 : value,
                                      std::chars_format::scientific, decimals);
    std::size_t const start = text.size();
    text.append(digits, result.ptr);
    text[text.find('e', start)] = 'E';
}

void writeMixed(std::string& text, double pieces, double denominator) {
    double const whole = std::floor(pieces / denominator);
    auto over = static_cast<std::int64_t>(pieces - whole * denominator);
    auto under = static_cast<std::int64_t>(denominator);
    if (whole > 0 || over == 0) writeFixed(text, whole, 0);
    if (over == 0) return;
    std::int64_t const shared = std::gcd(over, under);
    if (whole > 0) text += ' ';
    text += std::to_string(over / shared) + '/' + std::to_string(under / shared);
}

int divideByTwelve(std::string& digits) {
    int rest = 0;
    std::string quotient;
    for (char const digit : digits) {
        rest = rest * 10 + (digit - '0');
        if (rest >= 12 || !quotient.empty()) quotient += static_cast<char>('0' + rest / 12);
        rest %= 12;
    }
    digits = quotient.empty() ? "0" : quotient;
    return rest;
}

}  // namespace tzhost
