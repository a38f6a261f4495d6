#include "host/selection/selection_report.h"

#include "host/command_line/command_line.h"
#include "host/selection/selection_words.h"
#include "host/text/local_text.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {

std::wstring counted(int count, wchar_t const* format) {
    return TzString::formatted(format, count).str();
}

}  // namespace

std::wstring reportOf(Added const& added) {
    bool const isPerson = commandLine().isPerson();
    int const found = added.fresh + (isPerson ? added.alreadyThere : 0);
    std::wstring report = counted(found, localText(L"%d found"));
    if (isPerson && added.alreadyThere > 0)
        report += counted(added.alreadyThere, localText(L" (%d duplicate)"));
    if (added.onLockedLayers > 0)
        report += counted(added.onLockedLayers, localText(L", %d on a locked layer"));
    if (added.leftOut > 0) report += counted(added.leftOut, localText(L", %d left out"));
    bool const wasEmpty = added.total == added.fresh;
    if (isPerson && !wasEmpty) report += counted(added.total, localText(L", %d total"));
    return report;
}

std::wstring reportOf(Removed const& removed) {
    std::wstring report = counted(removed.count, localText(L"%d removed"));
    if (commandLine().isPerson()) report += counted(removed.total, localText(L", %d total"));
    return report;
}

std::wstring refusedSelection(std::wstring_view answer) {
    std::wstring report = localText(L"That selects nothing here.");
    if (!commandLine().isPerson()) return report;
    if (std::wstring const handle = missingHandle(answer); !handle.empty())
        return TzString::formatted(localText(L"There is no entity %ls here."), handle.c_str())
            .str();
    wchar_t const* const what = localText(L" Type a point, #HANDLE, %ls; Enter ends.");
    return report + TzString::formatted(what, selectionWords().c_str()).str();
}

}  // namespace tzhost
