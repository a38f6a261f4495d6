#include "apps/tzdraft/function_call.h"

#include <memory>
#include <string>

#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/command_line/command_line.h"
#include "host/database/open_state.h"
#include "host/runtime/functions.h"
#include "host/text/utf8.h"
#include "tz/rx/app.h"
#include "tz/rx/resbuf.h"

namespace tzdraft {
namespace {

struct ListDeleter {
    void operator()(resbuf* list) const { tzutRelRb(list); }
};
using Arguments = std::unique_ptr<resbuf, ListDeleter>;

constexpr std::wstring_view kBlanks = L" \t";

std::wstring_view trimmed(std::wstring_view text) {
    std::size_t const first = text.find_first_not_of(kBlanks);
    if (first == std::wstring_view::npos) return {};
    return text.substr(first, text.find_last_not_of(kBlanks) - first + 1);
}

Arguments textArgument(std::wstring_view text) {
    Arguments argument(tzutNewRb(Tzad::eResultString));
    if (argument) argument->resval.rstring = tzutNewString(std::wstring(text).c_str());
    return argument;
}

Arguments entityArgument(TzDbObjectId id) {
    Arguments argument(tzutNewRb(Tzad::eResultEntityName));
    if (argument && tzdbGetTzsName(argument->resval.rlname, id) != Tzad::eOk) return nullptr;
    return argument;
}

// The one argument as the function gets it. Without one `problem` says why; that is so as well when
// the host gives no record for it.
Arguments readArgument(std::wstring_view text, wchar_t const*& problem) {
    problem = forLocalText(L"the argument is neither an entity (#2A) nor a text (\"...\")");
    bool const isText = text.size() >= 2 && text.front() == L'"' && text.back() == L'"';
    if (isText) return textArgument(text.substr(1, text.size() - 2));
    if (!text.starts_with(L'#')) return nullptr;
    auto const handle = tzhost::readHandle(tzhost::toUtf8(text.substr(1)));
    if (!handle) return nullptr;
    problem = forLocalText(L"there is no such entity");
    return entityArgument(ProgramSession::current().drawing().objectAt(*handle));
}

void complain(std::wstring_view call, wchar_t const* what) {
    tzhost::commandLine().sayProblem(std::wstring(call) + L": " + what);
}

}  // namespace

void callTyped(std::wstring_view line) {
    std::wstring_view const whole = trimmed(line);
    if (whole.size() < 2 || whole.back() != L')')
        return complain(whole, localText(L"a call ends in \")\""));
    std::wstring_view const inside = trimmed(whole.substr(1, whole.size() - 2));
    std::size_t const blank = inside.find_first_of(kBlanks);
    std::wstring const name(inside.substr(0, blank));
    Arguments arguments;
    if (blank != std::wstring_view::npos) {
        wchar_t const* problem = nullptr;
        arguments = readArgument(trimmed(inside.substr(blank)), problem);
        if (!arguments) return complain(whole, localText(problem));
    }
    int const status = tzhost::callFunction(TzString(name), arguments.get());
    if (status == -1) return complain(whole, localText(L"no module defines this function"));
    if (status != TzRx::kRetOK) complain(whole, localText(L"the function failed"));
}

}  // namespace tzdraft
