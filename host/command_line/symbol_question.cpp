// The question for the name of a style, a layer or a block.

#include "host/base/fault_point.h"
#include "host/base/local_text.h"
#include "host/command_line/question.h"
#include "tz/ed/prompts.h"
#include "tz/rx/resbuf.h"

namespace {

constexpr std::wstring_view kNeverInNames = L"<>/\\\":;=`";
constexpr std::wstring_view kNotInNewNames = L"?*|,";  // patterns, and names of other drawings
constexpr std::size_t kLongestName = 255;

bool holdsControlCharacter(std::wstring_view text) {
    for (wchar_t const c : text) {
        if (c < L' ') return true;
    }
    return false;
}

bool isNameOrPattern(std::wstring_view text) {
    return text.size() <= kLongestName && !holdsControlCharacter(text) &&
           text.find_first_of(kNeverInNames) == std::wstring_view::npos;
}

class SymbolServices : public TzEdSymbolUtilities::Services {
public:
    [[nodiscard]] bool isValidSymbolName(wchar_t const* name) const override {
        if (tzhost::faultAt("TzEdSymbolUtilities::isValidSymbolName")) return false;
        std::wstring_view const text(name ? name : L"");
        return !text.empty() && text.front() != L' ' && text.back() != L' ' &&
               isNameOrPattern(text) && text.find_first_of(kNotInNewNames) == text.npos;
    }

    [[nodiscard]] int
    getSymbolString(wchar_t*& result, wchar_t const* prompt, TzDbDatabase* /*database*/) override {
        result = nullptr;
        if (auto const failed = tzhost::failsAt("TzEdSymbolUtilities::getSymbolString")) {
            return *failed;
        }
        tzhost::Question question(tzhost::QuestionKind::symbol, prompt);
        return question.ask([&](std::wstring_view answer) {
            if (!isNameOrPattern(answer)) {
                return tzhost::Reply::unreadable(tzhost::localText(
                    L"That is no name: it is too long or holds one of < > / \\ \" : ; = `"));
            }
            result = tzutNewString(std::wstring(answer).c_str());
            return tzhost::Reply::done(Tzad::ePromptNormal);
        });
    }
};

}  // namespace

TzEdSymbolUtilities::Services* TzEdSymbolUtilities::servicesPtr100() {
    static SymbolServices services;
    return &services;
}
