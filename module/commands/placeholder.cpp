#include "module/commands/placeholder.h"

#include "tz/ed/print.h"

void printNotYetAvailable(wchar_t const* command) {
    tzutPrintf(L"\n%ls is not available in this version.\n", command);
}
