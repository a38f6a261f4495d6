#pragma once

#include "module/prompt/input.h"

// Asks for a whole number from 2 to 100, as column counts need; the host refuses any other and asks
// again. An empty answer gives statusNone, and the result is then the default.
//
//   CTzsIntegerInput input(0x138F, none, gStringTable[1109]);
//   input.SetDefault(2);
//   if (input.Prompt() != statusCancel) use(input.GetInteger());
class CTzsIntegerInput : public CTzsInput {
public:
    using CTzsInput::CTzsInput;

    // Also clears bit 0 of the flags, so that an empty answer is no longer refused.
    virtual void SetDefault(int value);
    // The last answer, or the default after an empty one; 0 before one, and as it was after a
    // failure or a cancel.
    [[nodiscard]] virtual int GetInteger() const;
    // The default as the prompt shows it.
    [[nodiscard]] virtual TzString FormattedInteger() const;
    // 0 before SetDefault.
    [[nodiscard]] virtual int GetDefault() const;
    // Whether SetDefault was called.
    [[nodiscard]] virtual bool HasDefault() const;

    [[nodiscard]] TzString PromptString() const override;
    [[nodiscard]] int OnPrompt(TzString const& prompt) override;

private:
    int result_ = 0;
    int default_ = 0;
    bool hasDefault_ = false;
};
