#pragma once

#include "module/prompt/input.h"

// Asks for a text. An empty answer gives statusNone.
//
//   CTzsStringInput input(0, none, gStringTable[1074], true);
//   if (input.Prompt() == statusNormal) use(input.GetInput());
class CTzsStringInput : public CTzsInput {
public:
    // When spaces are not allowed, a blank ends the answer.
    CTzsStringInput(unsigned int theFlags,
                    CKeywordTable& table,
                    TzString const& prompt,
                    bool allowSpaces);

    [[nodiscard]] TzString GetInput() override;
    // The text that the prompt shows as the answer to Enter; the caller applies it.
    virtual void SetDefault(TzString const& text);
    // Empty before SetDefault.
    [[nodiscard]] virtual TzString GetDefault() const;
    // Whether SetDefault was called.
    [[nodiscard]] virtual bool HasDefault() const;

    [[nodiscard]] TzString PromptString() const override;
    [[nodiscard]] int OnPrompt(TzString const& prompt) override;

private:
    bool allowSpaces_;
    bool hasDefault_ = false;
    TzString default_;
};

// Asks for the name of a symbol, such as a text style: "?" and patterns too.
class CTzsSymbolStringInput : public CTzsStringInput {
public:
    CTzsSymbolStringInput(unsigned int theFlags, CKeywordTable& table, TzString const& prompt);

    [[nodiscard]] int OnPrompt(TzString const& prompt) override;
};
