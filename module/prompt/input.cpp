#include "module/prompt/input.h"

#include "tz/ed/print.h"
#include "tz/ed/prompts.h"
#include "tz/mte/globals.h"

CTzsInput::CTzsInput(unsigned int theFlags, CKeywordTable& table, TzString const& prompt)
    : promptText(prompt), keywords(table), flags(theFlags) {
    keywords.LoadStrings();
    keywordList = CTzsInput::KeywordList();
}

CTzsInput::~CTzsInput() = default;

int CTzsInput::Prompt() {
    inputText.setEmpty();
    Init();
    int const status = OnPrompt(PromptString() + L": ");
    tzutPrintf(L"\n");
    return status;
}

TzString CTzsInput::GetInput() {
    if (!inputText.isEmpty()) return inputText;
    TzString pending;
    if (tzedGetInput(pending) == statusNormal && !pending.isEmpty()) inputText = pending;
    return inputText;
}

unsigned int CTzsInput::GetKeyword() {
    unsigned int id = 0;
    (void)keywords.FindKeyword(GetInput(), id);  // sets 0 when there is none
    return id;
}

TzString CTzsInput::KeywordList() const {
    if (keywords.GetCount() == 0) return TzString();
    TzString localList;
    TzString globalList;
    TzString local;
    TzString global;
    for (int index = 0; index < keywords.GetCount(); ++index) {
        keywords.GetKeywords(index, local, global);
        localList += FormatAsKeyword(local) + L" ";
        globalList += FormatAsKeyword(global) + L" ";
    }
    return localList.left(localList.length() - 1) + gsLocalizationSeparator +
           globalList.left(globalList.length() - 1);
}

TzString CTzsInput::GetKeywordString(unsigned int id, bool local) const {
    return keywords.GetKeywordString(id, local);
}

TzString CTzsInput::PromptString() const {
    TzString list;
    TzString local;
    TzString global;
    for (int index = 0; index < keywords.GetCount(); ++index) {
        keywords.GetKeywords(index, local, global);
        list += FormatAsPromptOption(local) + L"/";
    }
    return list.left(list.length() - 1);
}

void CTzsInput::SetFlags(unsigned int newFlags) {
    flags = newFlags;
}

unsigned int CTzsInput::GetFlags() const {
    return flags;
}

void CTzsInput::Init() {
    // A host that does not arm the question asks it without keywords.
    (void)tzedInitGet(static_cast<int>(flags), keywordList);
}

TzString CTzsInput::DefaultPrompt(TzString const& text) const {
    if (keywords.GetCount() == 0) return text;
    TzString const list = CTzsInput::PromptString();
    return text.isEmpty() ? list : text + L" [" + list + L"]";
}

TzString CTzsInput::PromptWithDefault(TzString const& shownDefault) const {
    return DefaultPrompt(promptText + L" <" + shownDefault + L">");
}
