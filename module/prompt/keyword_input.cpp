#include "module/prompt/keyword_input.h"

#include "tz/ed/prompts.h"

void CTzsKeywordInput::SetDefault(unsigned int keywordId) {
    default_ = keywordId;
    hasDefault_ = true;
}

unsigned int CTzsKeywordInput::GetDefault() const {
    return default_;
}

bool CTzsKeywordInput::HasDefault() const {
    return hasDefault_;
}

TzString CTzsKeywordInput::PromptString() const {
    if (!HasDefault()) return DefaultPrompt();
    // Questions for values show their default before the keywords, this one after them.
    return DefaultPrompt() + L" <" + FormatAsPromptOption(GetKeywordString(GetDefault(), true)) +
           L">";
}

int CTzsKeywordInput::OnPrompt(TzString const& prompt) {
    TzString text;
    int const status = tzedGetKword(prompt, text);
    if (status == statusNormal && !text.isEmpty()) inputText = text;
    return status;
}
