#include "module/prompt/integer_input.h"

#include "tz/ed/prompts.h"

namespace {

constexpr int kLeast = 2;
constexpr int kMost = 100;

}  // namespace

void CTzsIntegerInput::SetDefault(int value) {
    default_ = value;
    hasDefault_ = true;
    SetFlags(GetFlags() & ~1U);
}

int CTzsIntegerInput::GetInteger() const {
    return result_;
}

TzString CTzsIntegerInput::FormattedInteger() const {
    return TzString::formatted(L"%d", GetDefault());
}

int CTzsIntegerInput::GetDefault() const {
    return default_;
}

bool CTzsIntegerInput::HasDefault() const {
    return hasDefault_;
}

TzString CTzsIntegerInput::PromptString() const {
    return HasDefault() ? PromptWithDefault(FormattedInteger()) : DefaultPrompt();
}

int CTzsIntegerInput::OnPrompt(TzString const& prompt) {
    int const status = tzedGetInt(prompt, &result_, kLeast, kMost);
    if (status == statusNone && HasDefault()) result_ = GetDefault();
    return status;
}
