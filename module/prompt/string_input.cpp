#include "module/prompt/string_input.h"

#include "tz/db/host_services.h"
#include "tz/ed/prompts.h"
#include "tz/rx/resbuf.h"

namespace {

// A text of the host's, given back on every way out.
struct HostText {
    HostText() = default;
    HostText(HostText const&) = delete;
    HostText& operator=(HostText const&) = delete;
    ~HostText() { tzutDelBuffer(text); }

    wchar_t* text = nullptr;
};

}  // namespace

CTzsStringInput::CTzsStringInput(unsigned int theFlags,
                                 CKeywordTable& table,
                                 TzString const& prompt,
                                 bool allowSpaces)
    : CTzsInput(theFlags, table, prompt), allowSpaces_(allowSpaces) {}

TzString CTzsStringInput::GetInput() {
    return inputText;
}

void CTzsStringInput::SetDefault(TzString const& text) {
    default_ = text;
    hasDefault_ = true;
}

TzString CTzsStringInput::GetDefault() const {
    return default_;
}

bool CTzsStringInput::HasDefault() const {
    return hasDefault_;
}

TzString CTzsStringInput::PromptString() const {
    return HasDefault() ? PromptWithDefault(GetDefault()) : DefaultPrompt();
}

int CTzsStringInput::OnPrompt(TzString const& prompt) {
    TzString text;
    int const status = tzedGetString(allowSpaces_ ? 1 : 0, prompt, text);
    if (status == statusNormal && !text.isEmpty()) inputText = text;
    return status == statusNormal && inputText.isEmpty() ? statusNone : status;
}

CTzsSymbolStringInput::CTzsSymbolStringInput(unsigned int theFlags,
                                             CKeywordTable& table,
                                             TzString const& prompt)
    : CTzsStringInput(theFlags, table, prompt, false) {}

int CTzsSymbolStringInput::OnPrompt(TzString const& prompt) {
    HostText name;
    int const status = TzEdSymbolUtilities::servicesPtr100()->getSymbolString(
        name.text, prompt, tzdbHostApplicationServices()->workingDatabase());
    if (status == statusNormal && name.text) inputText = name.text;
    return status;
}
