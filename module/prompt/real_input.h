#pragma once

#include "module/prompt/input.h"

// Asks for a real number. An empty answer gives statusNone, and the result is then the default.
//
//   CTzsRealInput input(6, none, gStringTable[1111]);
//   input.SetDefault(6.0);
//   if (input.Prompt() != statusCancel) use(input.GetReal());
class CTzsRealInput : public CTzsInput {
public:
    using CTzsInput::CTzsInput;

    // Also clears bit 0 of the flags, so that an empty answer is no longer refused.
    virtual void SetDefault(double value);
    // The last answer, or the default after an empty one; 0 before one, and as it was after a
    // failure or a cancel.
    [[nodiscard]] virtual double GetReal() const;
    // The default as the prompt shows it: a length in the drawing's units.
    [[nodiscard]] virtual TzString FormattedReal() const;
    // 0 before SetDefault.
    [[nodiscard]] virtual double GetDefault() const;
    // Whether SetDefault was called.
    [[nodiscard]] virtual bool HasDefault() const;

    [[nodiscard]] TzString PromptString() const override;
    [[nodiscard]] int OnPrompt(TzString const& prompt) override;

protected:
    // Puts the default in place of an empty answer; the status is handed through.
    [[nodiscard]] int WithDefault(int status);

    double result_ = 0;

private:
    double default_ = 0;
    bool hasDefault_ = false;
};
