#include "module/host_calls/sys_code_page.h"

#include <algorithm>
#include <cwchar>
#include <limits>

#include "module/host_calls/sys_var.h"

int SysCodePage() {
    TzString const name = CTzadSysVar::GetString(L"SYSCODEPAGE");
    TzString const digits = name.mid(name.findLast(L'_') + 1);
    long const number = std::wcstol(digits, nullptr, 10);
    return static_cast<int>(
        std::clamp<long>(number, std::numeric_limits<int>::min(), std::numeric_limits<int>::max()));
}
