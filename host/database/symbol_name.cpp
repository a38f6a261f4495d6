#include "host/database/symbol_name.h"

#include <algorithm>

namespace tzhost {
namespace {

constexpr std::wstring_view kNeverInNames = L"<>/\\\":;=`";
constexpr std::wstring_view kNotInNewNames = L"?*,|";  // patterns, and names of other drawings
constexpr std::size_t kLongestName = 255;

bool holdsOneOf(std::wstring_view text, std::wstring_view characters) {
    return text.find_first_of(characters) != text.npos;
}

}  // namespace

bool isNameOrPattern(std::wstring_view text) {
    return text.size() <= kLongestName && !holdsOneOf(text, kNeverInNames) &&
           std::all_of(text.begin(), text.end(), [](wchar_t c) { return c >= L' '; });
}

bool isSymbolName(std::wstring_view text) {
    return !text.empty() && text.front() != L' ' && text.back() != L' ' && isNameOrPattern(text) &&
           !holdsOneOf(text, kNotInNewNames);
}

}  // namespace tzhost
