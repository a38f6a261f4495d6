#pragma once

// Integer arithmetic that wraps: numbers in markup and rich text may have any number of digits.

// `value` with one more decimal digit at its end.
[[nodiscard]] constexpr int withDigit(int value, int digit) {
    return static_cast<int>(static_cast<unsigned int>(value) * 10U +
                            static_cast<unsigned int>(digit));
}

[[nodiscard]] constexpr int wrappingSum(int a, int b) {
    return static_cast<int>(static_cast<unsigned int>(a) + static_cast<unsigned int>(b));
}

[[nodiscard]] constexpr int wrappingProduct(int a, int b) {
    return static_cast<int>(static_cast<unsigned int>(a) * static_cast<unsigned int>(b));
}

[[nodiscard]] constexpr int wrappingNegative(int value) {
    return static_cast<int>(0U - static_cast<unsigned int>(value));
}

// Only "0" to "9" are digits here, whatever the locale.
[[nodiscard]] constexpr bool isDigit(wchar_t c) {
    return c >= L'0' && c <= L'9';
}

// The value of a hex digit of either case, or -1.
[[nodiscard]] constexpr int hexDigitValue(wchar_t c) {
    if (isDigit(c)) return c - L'0';
    if (c >= L'a' && c <= L'f') return c - L'a' + 10;
    if (c >= L'A' && c <= L'F') return c - L'A' + 10;
    return -1;
}
