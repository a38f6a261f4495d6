#include "tz/ed/warning.h"

#include <string>
#include <string_view>

#include "host/platform/output.h"

namespace {

// The text of a format that has no arguments. It ends at the first percent sign that asks for one.
std::wstring withoutArguments(wchar_t const* format) {
    std::wstring_view rest(format ? format : L"");
    std::wstring text;
    for (;;) {
        std::size_t const percent = rest.find(L'%');
        text += rest.substr(0, percent);
        if (percent == rest.npos || rest.substr(percent, 2) != L"%%") return text;
        text += L'%';
        rest.remove_prefix(percent + 2);
    }
}

}  // namespace

void tzutWarning(wchar_t const* id, bool printed, wchar_t const* format) {
    tzhost::notify({.kind = tzhost::NotificationKind::warning,
                    .id = id ? id : L"",
                    .text = withoutArguments(format),
                    .caption = {},
                    .printed = printed});
}
