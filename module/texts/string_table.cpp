#include "module/texts/string_table.h"

#include "module/host_calls/sys_var.h"
#include "module/texts/resources.h"

namespace {

// A name in braces has at most 16 characters, so its closing brace stands before this index.
constexpr int kClosingBraceLimit = 17;

TzString valueOf(TzString const& name) {
    if (name.isEmpty()) return TzString();
    if (name == L"(") return TzString(L"{");
    if (name == L")") return TzString(L"}");
    return CTzadSysVar::GetString(name);
}

}  // namespace

TzStringTable gStringTable;

TzString TzStringTable::operator[](unsigned int id) const {
    TzString rest = loadResourceString(static_cast<int>(id));
    TzString result;
    for (int open; (open = rest.find(L'{')) != -1;) {
        result += rest.left(open);
        rest = rest.mid(open + 1);
        int const close = rest.find(L'}');
        // When the closing brace is missing or stands too late, the opening brace is plain text,
        // and so is the rest.
        if (close == -1 || close >= kClosingBraceLimit) return result + L"{" + rest;
        result += valueOf(rest.left(close));
        rest = rest.mid(close + 1);
    }
    return result + rest;
}
