#include "module/prompt/jig_input.h"

CTzsJigInput::CTzsJigInput(TzEdJig::UserInputControls controls,
                           CKeywordTable& table,
                           CTzsJigEntity* preview,
                           TzString const& prompt)
    : CTzsInput(static_cast<unsigned int>(controls), table, prompt), driver_(preview, controls) {
    driver_.setSampledKeywords(keywordList);
}

unsigned int CTzsJigInput::GetKeyword() {
    return resultKeyword_;
}

TzString CTzsJigInput::PromptString() const {
    return DefaultPrompt();
}

TzEdJigInputData const& CTzsJigInput::getInputData() const {
    return tzedGetJigInputData(driver_);
}

// The driver arms its keywords when it samples.
void CTzsJigInput::Init() {
    resultKeyword_ = 0;
}

int CTzsJigInput::OnPrompt(TzString const& prompt) {
    constexpr int kLastKeyword = 30;
    driver_.setDispPrompt(prompt);
    int const dragged = driver_.drag();
    if (dragged >= TzEdJig::kKW1 && dragged <= kLastKeyword) {
        if (dragged <= GetKeywordCount()) resultKeyword_ = keywords.GetKeywordID(dragged - 1);
        return statusKeyword;
    }
    switch (dragged) {
    case TzEdJig::kNormal: return statusNormal;
    case TzEdJig::kNull: return statusNone;
    case TzEdJig::kCancel: return statusCancel;
    default: return statusError;
    }
}
