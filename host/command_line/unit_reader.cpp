#include "host/command_line/unit_reader.h"

#include <charconv>
#include <cmath>
#include <system_error>

namespace tzhost {

namespace {

constexpr wchar_t kLastAscii = 0x7F;
constexpr char kNoCharacter = '\x01';  // stands for everything outside ASCII

bool isDigit(char c) {
    return c >= '0' && c <= '9';
}

char capital(char c) {
    return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
}

// Of a number out of range: whether it is too small rather than too large.
bool isTiny(std::string_view number) {
    std::size_t const exponent = number.find_first_of("eE");
    if (exponent != std::string_view::npos && number.substr(exponent + 1).front() == '-')
        return true;
    return number.substr(0, number.find_first_of(".eE")).find_first_not_of('0') ==
           std::string_view::npos;
}

}  // namespace

UnitReader::UnitReader(std::wstring_view text) {
    std::size_t const first = text.find_first_not_of(L" \t");
    text.remove_prefix(first == std::wstring_view::npos ? text.size() : first);
    text = text.substr(0, text.find_last_not_of(L" \t") + 1);
    char* target = short_;
    if (text.size() > kShort) {
        long_.resize(text.size());
        target = long_.data();
    }
    at_ = target;
    for (wchar_t const c : text)
        *target++ = c > 0 && c <= kLastAscii ? static_cast<char>(c) : kNoCharacter;
    end_ = target;
}

char UnitReader::peek() const {
    return isAtEnd() ? '\0' : capital(*at_);
}

bool UnitReader::skip(char c) {
    if (isAtEnd() || capital(*at_) != capital(c)) return false;
    ++at_;
    return true;
}

void UnitReader::skipBlanks() {
    while (!isAtEnd() && (*at_ == ' ' || *at_ == '\t'))
        ++at_;
}

double UnitReader::readSign() {
    if (skip('-')) return -1.0;
    skip('+');
    return 1.0;
}

bool UnitReader::readNumber(double& value) {
    bool const isNumber =
        !isAtEnd() && (isDigit(*at_) || (*at_ == '.' && at_ + 1 != end_ && isDigit(at_[1])));
    if (!isNumber) return false;
    double read = 0;
    auto const result = std::from_chars(at_, end_, read);
    if (result.ec == std::errc::result_out_of_range) {
        if (!isTiny({at_, static_cast<std::size_t>(result.ptr - at_)})) return false;
        read = 0;
    }
    at_ = result.ptr;
    value = read;
    return true;
}

bool UnitReader::readFraction(double& value) {
    char const* const before = at_;
    double over = 0;
    double under = 0;
    if (readNumber(over) && skip('/') && readNumber(under) && under != 0 &&
        std::isfinite(over / under)) {
        value = over / under;
        return true;
    }
    at_ = before;
    return false;
}

bool UnitReader::readMixed(double& value) {
    if (readFraction(value)) return true;
    char const* const start = at_;
    double whole = 0;
    if (!readNumber(whole)) return false;
    char const* const before = at_;
    double fraction = 0;
    if (!skip('-')) skipBlanks();
    if (at_ == before || !readFraction(fraction)) at_ = before;
    if (!std::isfinite(whole + fraction)) {
        at_ = start;
        return false;
    }
    value = whole + fraction;
    return true;
}

}  // namespace tzhost
