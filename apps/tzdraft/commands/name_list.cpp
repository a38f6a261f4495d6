#include "apps/tzdraft/commands/name_list.h"

#include "apps/tzdraft/program_texts.h"
#include "host/command_line/symbol_names.h"
#include "tz/ed/print.h"

namespace tzdraft {

void listNames(TzDbObjectId table) {
    std::vector<std::wstring> const names = tzhost::symbolNames(table);
    for (std::wstring const& each : names)
        tzutPrintf(L"\n  %ls", each.c_str());
    tzutPrintf(names.empty() ? localText(L"\nThere are none yet.\n") : L"\n");
}

}  // namespace tzdraft
