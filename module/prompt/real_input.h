#pragma once

#include "module/prompt/input.h"

// Asks for a real number. An empty answer gives statusNone, and the result is then the default.
//
//   CTzsRealInput input(6, none, gStringTable[1111]);
//   input.SetDefault(6.0);
//   input.Prompt();
//   use(input.GetReal());
class CTzsRealInput : public CTzsInput {
public:
    using CTzsInput::CTzsInput;

    // Also lets an empty answer through (bit 0 of the flags) that the flags refused.
    virtual void SetDefault(double value);
    [[nodiscard]] virtual double GetReal() const;
    // The default as the prompt shows it: a length in the drawing's units.
    [[nodiscard]] virtual TzString FormattedReal() const;
    [[nodiscard]] virtual double GetDefault() const;
    [[nodiscard]] virtual bool HasDefault() const;

    [[nodiscard]] TzString PromptString() const override;
    int OnPrompt(TzString const& prompt) override;

protected:
    // Puts the default in place of an empty answer; the status is handed through.
    int WithDefault(int status);

    double result_ = 0;

private:
    double default_ = 0;
    bool hasDefault_ = false;
};
