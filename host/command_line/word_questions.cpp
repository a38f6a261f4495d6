// The questions for words and texts, and what arms and follows a question.

#include "host/base/fault_point.h"
#include "host/command_line/question.h"
#include "host/settings/variables.h"
#include "host/text/local_text.h"
#include "tz/ed/prompts.h"

using tzhost::commandLine;
using tzhost::Question;
using tzhost::QuestionKind;
using tzhost::Reply;

int tzedInitGet(int flags, wchar_t const* keywords) {
    if (auto const fault = tzhost::faultAt("tzedInitGet")) return *fault;
    std::wstring list(keywords ? keywords : L"");
    auto words = tzhost::KeywordList::parse(list);
    if (!words) return Tzad::ePromptError;
    commandLine().arm({flags, std::move(*words), std::move(list)});
    return Tzad::ePromptNormal;
}

int tzedGetInput(TzString& result) {
    result.setEmpty();
    if (auto const fault = tzhost::faultAt("tzedGetInput")) return *fault;
    auto input = commandLine().takeInput();
    if (!input) return Tzad::ePromptError;
    result = TzString(std::move(*input));
    return Tzad::ePromptNormal;
}

int tzedGetKword(wchar_t const* prompt, TzString& result) {
    if (auto const failed = tzhost::failsAt("tzedGetKword")) return *failed;
    Question question(QuestionKind::keyword, prompt);
    question.setWordReader([&](int index) {
        result = TzString(question.armed().words.global(index));
        return Reply::done(Tzad::ePromptNormal);
    });
    return question.ask([](std::wstring_view) {
        return Reply::unreadable(tzhost::localText(L"That is none of the words in question."));
    });
}

int tzedGetString(int allowSpaces, wchar_t const* prompt, TzString& result) {
    result.setEmpty();
    if (auto const failed = tzhost::failsAt("tzedGetString")) return *failed;
    Question question(QuestionKind::string, prompt);
    question.setEndings(Tzad::ePromptNormal, Tzad::ePromptCancel);
    return question.ask([&](std::wstring_view answer) {
        result = TzString(allowSpaces != 0 ? answer : answer.substr(0, answer.find(L' ')));
        return Reply::done(Tzad::ePromptNormal);
    });
}

bool tzedInitDialog(bool /*useDefaults*/) {
    if (tzhost::faultAt("tzedInitDialog")) return false;
    return tzhost::Variables::instance().number(L"DIALOGS") != 0;
}

bool tzedMacroPlayback() {
    if (tzhost::faultAt("tzedMacroPlayback")) return false;
    return tzhost::Variables::instance().number(L"MACROPLAYBACK") != 0;
}
