#include "host/editors/dialog_questions.h"

#include "host/command_line/question.h"
#include "host/text/local_text.h"
#include "tz/rx/status.h"
#include "tz/text/string.h"

namespace tzhost {
namespace {

// The status of the question.
int askValue(DialogValue const& row, CMTextEditorInterface const& state, DialogChanges& changes) {
    wchar_t const* const name = localText(row.name);
    wchar_t const* const expected = localText(row.expected);
    TzString const prompt =
        TzString::formatted(L"%ls, %ls <%ls>: ", name, expected, row.shown(state).c_str());
    Question question(QuestionKind::string, prompt, {});
    return question.ask([&](std::wstring_view answer) {
        DialogChange change = row.read(state, answer);
        if (!change) {
            return Reply::refused(
                TzString::formatted(localText(L"That is no value for %ls, expected %ls."), name,
                                    expected)
                    .str());
        }
        changes.add(std::move(change));
        return Reply::done(Tzad::ePromptNormal);
    });
}

}  // namespace

bool askDialogValues(CMTextEditorInterface const& state, DialogChanges& changes) {
    for (DialogValue const& row : dialogValues()) {
        int const status = askValue(row, state, changes);
        if (status != Tzad::ePromptNormal && status != Tzad::ePromptNone) return false;
    }
    return true;
}

}  // namespace tzhost
