#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/program_texts.h"
#include "host/command_line/command_line.h"
#include "host/settings/variable_table.h"
#include "host/settings/variables.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

void listVariables() {
    tzhost::Variables& variables = tzhost::Variables::instance();
    for (tzhost::VariableDefinition const& each : tzhost::variableTable()) {
        tzhost::VariableValue const* const value = variables.get(each.name);
        if (!value) continue;
        tzutPrintf(L"\n%-22ls %ls%ls", std::wstring(each.name).c_str(),
                   tzhost::writeValue(*value).c_str(),
                   each.access == tzhost::Access::readOnly ? localText(L" (read only)") : L"");
    }
    tzutPrintf(L"\n");
}

// What a script sets of MTEXTED holds for this run, so that no script decides which program runs in
// later sessions.
tzhost::WriteResult write(TzString const& name, std::wstring const& value) {
    tzhost::Variables& variables = tzhost::Variables::instance();
    bool const choosesProgram = name.compareNoCase(L"MTEXTED") == 0;
    if (choosesProgram && !tzhost::commandLine().isPerson())
        return variables.overrideFromText(name.str(), value);
    return variables.setFromText(name.str(), value, tzhost::Writer::user);
}

bool isVariableOrList(Answer<TzString> const& name) {
    if (name.value == L"?" || tzhost::Variables::instance().get(name.value.str())) return true;
    tellProblem(localText(L"There is no system variable \"%ls\"; ? lists them."),
                name.value.kwszPtr());
    return false;
}

// "." stands for the empty text, which Enter cannot give.
bool isWritten(TzString const& name, TzString const& value) {
    tzhost::WriteResult const written = write(name, value == L"." ? std::wstring() : value.str());
    if (!written.isDone()) tellProblem(L"%ls", written.reason.c_str());
    return written.isDone();
}

}  // namespace

void setvarCommand() {
    Answer<TzString> const name =
        askUntil([] { return askName(localText(L"Variable name or [?]"), offerVariables()); },
                 isVariableOrList);
    if (name.asked != Asked::given) return;
    if (name.value == L"?") return listVariables();
    TzString const shown(tzhost::writeValue(*tzhost::Variables::instance().get(name.value.str())));
    if (tzhost::findVariable(name.value.str())->access == tzhost::Access::readOnly) {
        return tellProblem(localText(L"%ls is read-only: %ls"), name.value.kwszPtr(),
                           shown.kwszPtr());
    }
    TzString const question = TzString::formatted(localText(L"New value for %ls <%ls>"),
                                                  name.value.kwszPtr(), shown.kwszPtr());
    (void)askUntil(
        [&] { return askText(question); },
        [&](Answer<TzString> const& value) { return isWritten(name.value, value.value); });
}

}  // namespace tzdraft
