#include "host/text/format_conversions.h"

#include <algorithm>

namespace tzhost {

std::optional<std::vector<std::wstring>> conversionsOf(std::wstring_view format) {
    std::vector<std::wstring> found;
    for (;;) {
        std::size_t const percent = format.find(L'%');
        if (percent == format.npos) return found;
        format.remove_prefix(percent + 1);
        std::size_t const flags = format.find_first_not_of(L"-+#0123456789.*");
        if (flags == format.npos) return std::nullopt;
        format.remove_prefix(flags);
        std::size_t const length = std::min(format.find_first_not_of(L"hljztL"), format.size());
        if (length == format.size()) return std::nullopt;
        wchar_t const letter = format[length];
        if (std::wstring_view(L"diouxXeEfFgGaAcs%").find(letter) == std::wstring_view::npos) {
            return std::nullopt;
        }
        std::wstring conversion(letter == L's' ? L"" : format.substr(0, length));
        found.push_back(conversion += letter);
        format.remove_prefix(length + 1);
    }
}

}  // namespace tzhost
