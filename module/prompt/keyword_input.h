#pragma once

#include "module/prompt/input.h"

// Asks for one of the keywords.
//
//   CTzsKeywordInput input(0, table, gStringTable[1072]);
//   input.SetDefault(1048);                      // "... [words] <Top left>: "
//   if (input.Prompt() == statusNormal) use(input.GetKeyword());
class CTzsKeywordInput : public CTzsInput {
public:
    using CTzsInput::CTzsInput;

    // The keyword that the prompt shows as the answer to Enter; the caller applies it.
    virtual void SetDefault(unsigned int keywordId);
    // 0 before SetDefault.
    [[nodiscard]] virtual unsigned int GetDefault() const;
    // Whether SetDefault was called.
    [[nodiscard]] virtual bool HasDefault() const;

    [[nodiscard]] TzString PromptString() const override;
    [[nodiscard]] int OnPrompt(TzString const& prompt) override;

private:
    bool hasDefault_ = false;
    unsigned int default_ = 0;
};
