// The host's formatted text: a printf of its own for wide formats. The C library's differs from
// what the callers need in three ways: its "%s" takes narrow text in a wide format, its numbers
// follow the locale, and it must be told the size of its result.

#include <array>
#include <charconv>
#include <cstddef>
#include <cstdio>
#include <cwchar>
#include <string>
#include <string_view>

#include "host/text/number_locale.h"
#include "tz/text/string.h"

namespace {

// Wider fields and longer fractions are cut to this; no caller needs more.
constexpr int kMostWidth = 65535;

enum class Length { normal, hh, h, l, ll, j, z, t, L };

// One conversion of a format, from the percent sign to its letter.
struct Directive {
    std::string flags;  // in the order as written
    int width = -1;
    int precision = -1;
    Length length = Length::normal;
    wchar_t letter = 0;

    // The common case, a plain decimal number, which is written without the C library.
    [[nodiscard]] bool isPlainDecimal() const {
        return flags.empty() && width < 0 && precision < 0 &&
               (letter == L'd' || letter == L'i' || letter == L'u');
    }
    [[nodiscard]] bool isLeft() const { return flags.find('-') != std::string::npos; }
};

struct LengthRow {
    std::wstring_view text;
    Length length;
};

// The first row that fits is taken, so "hh" stands before "h" and "ll" before "l".
constexpr LengthRow kLengths[] = {
    {L"hh", Length::hh}, {L"h", Length::h}, {L"ll", Length::ll},
    {L"l", Length::l},   {L"j", Length::j}, {L"z", Length::z},
    {L"t", Length::t},   {L"L", Length::L}, {L"q", Length::ll},
};

// Runs a format over its arguments. `arguments_` is used up in the order of the conversions.
class Formatter {
public:
    Formatter(wchar_t const* format, va_list arguments) : at_(format ? format : L"") {
        va_copy(arguments_, arguments);
    }
    ~Formatter() { va_end(arguments_); }
    Formatter(Formatter const&) = delete;
    Formatter& operator=(Formatter const&) = delete;

    [[nodiscard]] std::wstring run() {
        while (*at_ != 0) {
            std::size_t const plain = std::wcscspn(at_, L"%");
            text_.append(at_, plain);
            at_ += plain;
            if (*at_ == 0) break;
            Directive directive;
            if (!read(directive) || !write(directive)) break;
        }
        return std::move(text_);
    }

private:
    // Steps over a conversion; false when the format ends inside it.
    bool read(Directive& directive) {
        ++at_;
        for (; *at_ != 0 && std::wcschr(L"-+ #0", *at_) != nullptr; ++at_) {
            directive.flags += static_cast<char>(*at_);
        }
        directive.width = count();
        if (directive.width < -1) {
            directive.flags += '-';
            directive.width = -directive.width;
        }
        if (*at_ == L'.') {
            ++at_;
            directive.precision = count();
            if (directive.precision == -1) directive.precision = 0;
        }
        for (LengthRow const& row : kLengths) {
            if (std::wstring_view(at_).substr(0, row.text.size()) != row.text) continue;
            directive.length = row.length;
            at_ += row.text.size();
            break;
        }
        directive.letter = *at_;
        if (*at_ != 0) ++at_;
        return directive.letter != 0;
    }

    // A width or precision: digits, or "*" for the next argument; -1 without any.
    int count() {
        if (*at_ == L'*') {
            ++at_;
            int const given = va_arg(arguments_, int);
            return given < -kMostWidth ? -kMostWidth : given > kMostWidth ? kMostWidth : given;
        }
        if (*at_ < L'0' || *at_ > L'9') return -1;
        int value = 0;
        for (; *at_ >= L'0' && *at_ <= L'9'; ++at_) {
            if (value < kMostWidth) value = value * 10 + (*at_ - L'0');
        }
        return value < kMostWidth ? value : kMostWidth;
    }

    // False at a letter that is no conversion.
    bool write(Directive const& directive) {
        switch (directive.letter) {
        case L'%': text_ += L'%'; return true;
        case L'd':
        case L'i': number(directive, nextSigned(directive.length)); return true;
        case L'u':
        case L'o':
        case L'x':
        case L'X': number(directive, nextUnsigned(directive.length)); return true;
        case L'e':
        case L'E':
        case L'f':
        case L'F':
        case L'g':
        case L'G':
        case L'a':
        case L'A': real(directive); return true;
        case L'c':
        case L'C':
            field(directive,
                  std::wstring(1, static_cast<wchar_t>(va_arg(arguments_, std::wint_t))));
            return true;
        case L's':
        case L'S': wideOrNarrowText(directive); return true;
        case L'p': pointer(directive); return true;
        default: return false;
        }
    }

    long long nextSigned(Length length) {
        switch (length) {
        case Length::hh: return static_cast<signed char>(va_arg(arguments_, int));
        case Length::h: return static_cast<short>(va_arg(arguments_, int));
        case Length::normal: return va_arg(arguments_, int);
        default:
            static_assert(sizeof(long) == sizeof(long long));
            return va_arg(arguments_, long long);
        }
    }

    unsigned long long nextUnsigned(Length length) {
        switch (length) {
        case Length::hh: return static_cast<unsigned char>(va_arg(arguments_, unsigned));
        case Length::h: return static_cast<unsigned short>(va_arg(arguments_, unsigned));
        case Length::normal: return va_arg(arguments_, unsigned);
        default: return va_arg(arguments_, unsigned long long);
        }
    }

    // The narrow format of one conversion, width and precision as arguments.
    static std::string narrowFormat(Directive const& directive, char const* length) {
        std::string format = "%" + directive.flags;
        if (directive.width >= 0) format += std::to_string(directive.width);
        if (directive.precision >= 0) format += '.' + std::to_string(directive.precision);
        return format + length + static_cast<char>(directive.letter);
    }

    template <class Value>
    void number(Directive const& directive, Value value) {
        if (!directive.isPlainDecimal()) {
            appendNarrow(narrowFormat(directive, "ll"), value);
            return;
        }
        std::array<char, 24> room;
        auto const [end, error] = std::to_chars(room.data(), room.data() + room.size(), value);
        text_.append(room.data(), end);
    }

    void real(Directive const& directive) {
        if (directive.length == Length::L) {
            appendNarrow(narrowFormat(directive, "L"), va_arg(arguments_, long double));
        } else {
            appendNarrow(narrowFormat(directive, ""), va_arg(arguments_, double));
        }
    }

    void pointer(Directive const& directive) {
        Directive plain = directive;
        plain.precision = -1;
        appendNarrow(narrowFormat(plain, ""), va_arg(arguments_, void*));
    }

    template <class Value>
    void appendNarrow(std::string const& format, Value value) {
        tzhost::NumberLocale const inC;
        std::array<char, 512> room;
        int const length = std::snprintf(room.data(), room.size(), format.c_str(), value);
        if (length < 0) return;
        auto const size = static_cast<std::size_t>(length);
        if (size < room.size()) {
            text_.append(room.data(), room.data() + size);
            return;
        }
        std::string large(size + 1, '\0');
        std::snprintf(large.data(), large.size(), format.c_str(), value);
        text_.append(large.begin(), large.end() - 1);
    }

    // Wide text, but narrow text (UTF-8) for "%hs". A precision cuts the text and bounds what is
    // read of it.
    void wideOrNarrowText(Directive const& directive) {
        bool const isBounded = directive.precision >= 0;
        auto const most = static_cast<std::size_t>(isBounded ? directive.precision : 0);
        if (directive.length == Length::h || directive.length == Length::hh) {
            char const* const text = va_arg(arguments_, char const*);
            std::wstring wide = TzString::fromUtf8(text ? text : "(null)").str();
            field(directive, isBounded ? wide.substr(0, most) : wide);
            return;
        }
        wchar_t const* text = va_arg(arguments_, wchar_t const*);
        if (text == nullptr) text = L"(null)";
        field(directive,
              std::wstring_view(text, isBounded ? wcsnlen(text, most) : std::wcslen(text)));
    }

    void field(Directive const& directive, std::wstring_view content) {
        auto const width = static_cast<std::size_t>(directive.width > 0 ? directive.width : 0);
        std::size_t const blanks = width > content.size() ? width - content.size() : 0;
        if (!directive.isLeft()) text_.append(blanks, L' ');
        text_ += content;
        if (directive.isLeft()) text_.append(blanks, L' ');
    }

    wchar_t const* at_;
    va_list arguments_;
    std::wstring text_;
};

}  // namespace

std::wstring tzFormatV(wchar_t const* format, va_list arguments) {
    return Formatter(format, arguments).run();
}

TzString& TzString::formatV(wchar_t const* format, va_list arguments) {
    text_ = tzFormatV(format, arguments);
    return *this;
}

TzString& TzString::format(wchar_t const* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    formatV(format, arguments);
    va_end(arguments);
    return *this;
}

TzString TzString::formatted(wchar_t const* format, ...) {
    va_list arguments;
    va_start(arguments, format);
    TzString result;
    result.formatV(format, arguments);
    va_end(arguments);
    return result;
}
