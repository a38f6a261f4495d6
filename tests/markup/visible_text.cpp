#include "tests/markup/visible_text.h"

#include <string_view>

namespace markuptest {

std::wstring visibleText(std::wstring const& markup) {
    std::wstring text;
    for (std::size_t at = 0; at < markup.size(); ++at) {
        wchar_t const c = markup[at];
        if (c == L'{' || c == L'}') continue;
        if (c != L'\\') {
            text += c;
            continue;
        }
        wchar_t const code = markup[++at];
        if (code == L'P') {
            text += L'\n';
        } else if (code == L'U') {
            text += static_cast<wchar_t>(std::stoul(markup.substr(at + 2, 4), nullptr, 16));
            at += 5;
        } else if (std::wstring_view(L"FfHCcpA").find(code) != std::wstring_view::npos) {
            at = markup.find(L';', at);
        } else if (std::wstring_view(L"LlOo").find(code) == std::wstring_view::npos) {
            text += code;
        }
    }
    return text + L'\n';
}

}  // namespace markuptest
