#include "module/commands/placeholder.h"

#include "module/access/string_table.h"
#include "tz/ed/print.h"

namespace {

constexpr unsigned kNotYetAvailable = 1024;

}  // namespace

void printNotYetAvailable(wchar_t const* command) {
    tzutPrintf(gStringTable[kNotYetAvailable], command);
}
