#include "host/selection/wildcard.h"

#include "host/base/fault_point.h"
#include "tz/ed/selection.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {

// Where the class that opens at `start` ends: at its "]", or npos when it has none.
std::size_t endOfClass(std::wstring_view pattern, std::size_t start) {
    return pattern.find(L']', start + 1);
}

// Cuts the first pattern off a list; a comma inside a class belongs to the class.
std::wstring_view takePattern(std::wstring_view& list) {
    std::size_t end = 0;
    while (end < list.size() && list[end] != L',') {
        std::size_t const close = list[end] == L'[' ? endOfClass(list, end) : list.npos;
        end = close == list.npos ? end + 1 : close + 1;
    }
    std::wstring_view const pattern = list.substr(0, end);
    list.remove_prefix(end < list.size() ? end + 1 : end);
    return pattern;
}

// One pattern without its "~".
class Matcher {
public:
    Matcher(std::wstring_view pattern, Case letters) : pattern_(pattern), letters_(letters) {}

    // A star gives a place to come back to, with one character more; only the last one counts.
    [[nodiscard]] bool matches(std::wstring_view text) const {
        std::size_t at = 0;
        std::size_t in = 0;
        std::size_t star = text.npos;
        std::size_t taken = 0;
        while (at < text.size()) {
            std::size_t next = 0;
            if (in < pattern_.size() && pattern_[in] == L'*') {
                star = ++in;
                taken = at;
            } else if (matchesOne(text[at], in, next)) {
                ++at;
                in = next;
            } else if (star != text.npos) {
                in = star;
                at = ++taken;
            } else {
                return false;
            }
        }
        return pattern_.find_first_not_of(L'*', in) == pattern_.npos;
    }

private:
    [[nodiscard]] wchar_t fold(wchar_t c) const {
        return letters_ == Case::ignored ? tzToLower(c) : c;
    }

    // Whether the element of the pattern at `in` takes a character; `next` is the element after
    // it.
    [[nodiscard]] bool matchesOne(wchar_t c, std::size_t in, std::size_t& next) const {
        if (in >= pattern_.size()) return false;
        next = in + 1;
        if (pattern_[in] == L'?') return true;
        std::size_t const close = pattern_[in] == L'[' ? endOfClass(pattern_, in) : pattern_.npos;
        if (close == pattern_.npos) return fold(c) == fold(pattern_[in]);
        next = close + 1;
        return isInClass(c, pattern_.substr(in + 1, close - in - 1));
    }

    [[nodiscard]] bool isInClass(wchar_t c, std::wstring_view members) const {
        bool const isNegated = members.starts_with(L'~');
        if (isNegated) members.remove_prefix(1);
        c = fold(c);
        for (std::size_t i = 0; i < members.size(); ++i) {
            bool const isRange = i + 2 < members.size() && members[i + 1] == L'-';
            wchar_t const last = fold(members[isRange ? i + 2 : i]);
            if (c >= fold(members[i]) && c <= last) return !isNegated;
            if (isRange) i += 2;
        }
        return isNegated;
    }

    std::wstring_view pattern_;
    Case letters_;
};

}  // namespace

bool matchesPattern(std::wstring_view text, std::wstring_view patterns, Case letters) {
    do {
        std::wstring_view pattern = takePattern(patterns);
        bool const isNegated = pattern.starts_with(L'~');
        if (isNegated) pattern.remove_prefix(1);
        if (Matcher(pattern, letters).matches(text) != isNegated) return true;
    } while (!patterns.empty());
    return false;
}

}  // namespace tzhost

bool tzutWcMatchEx(wchar_t const* text, wchar_t const* pattern, bool ignoreCase) {
    if (tzhost::faultAt("tzutWcMatchEx")) return false;
    return tzhost::matchesPattern(text ? text : L"", pattern ? pattern : L"",
                                  ignoreCase ? tzhost::Case::ignored : tzhost::Case::exact);
}
