#include "apps/tzdraft/typed_file.h"

#include <cstdlib>

#include "host/text/utf8.h"

namespace tzdraft {

std::filesystem::path fileTyped(std::wstring_view name) {
    char const* const home = std::getenv("HOME");
    bool const isAtHome = name.starts_with(L"~/") && home != nullptr && *home == '/';
    return isAtHome ? home + tzhost::toUtf8(name.substr(1)) : tzhost::toUtf8(name);
}

}  // namespace tzdraft
