#pragma once

#include "module/prompt/keyword_table.h"
#include "tz/text/string.h"

// One question at the command line. An input is built on the stack, told its default, asked,
// usually in a loop, and read:
//
//   CKeywordTable none;
//   CTzsRealInput input(6, none, gStringTable[1111]);
//   input.SetDefault(6.0);
//   int const status = input.Prompt();      // "Prompt text [Keywords] <Default>: "
//   if (status == statusNone || status == statusNormal) use(input.GetReal());
//
// An input prints no error and never repeats by itself; it gives the host's status.

enum PromptStatus : int {
    statusNormal = 5100,   // a value was given
    statusNone = 5000,     // an empty answer
    statusError = -5001,   // a failure or a refused answer
    statusCancel = -5002,  // the user cancelled
    statusKeyword = -5005  // a keyword or free text was given
};

// Bits of a question's flags: answers that the host refuses, and asks again. Other bits change
// nothing.
inline constexpr unsigned kRefusesEmpty = 1;
inline constexpr unsigned kRefusesZero = 2;
inline constexpr unsigned kRefusesNegative = 4;
inline constexpr unsigned kTakesFreeText = 0x80;  // gives it back as statusKeyword

class CTzsInput {
public:
    // `flags` go to tzedInitGet with each asking. The table is copied, its ids stay borrowed.
    CTzsInput(unsigned int theFlags, CKeywordTable& table, TzString const& prompt);
    CTzsInput(CTzsInput const&) = delete;
    CTzsInput& operator=(CTzsInput const&) = delete;

    // Asks once and ends the line; the status.
    [[nodiscard]] virtual int Prompt();
    // The text of the last answer: the global word of a keyword, or free text.
    [[nodiscard]] virtual TzString GetInput();
    // The id of the keyword that was answered; 0 when the answer is none.
    [[nodiscard]] virtual unsigned int GetKeyword();
    virtual ~CTzsInput();
    // The keywords as tzedInitGet takes them: local words, a separator, global words.
    [[nodiscard]] virtual TzString KeywordList() const;
    // One part of a keyword's text; empty for an id that is not in the table.
    [[nodiscard]] virtual TzString GetKeywordString(unsigned int id, bool local) const;
    // The prompt with brackets and default, without the colon. The body in this class gives what
    // stands in the brackets.
    [[nodiscard]] virtual TzString PromptString() const = 0;
    // The two steps of Prompt: arms the host for the next question; asks the host for the status.
    virtual void Init();
    [[nodiscard]] virtual int OnPrompt(TzString const& prompt) = 0;
    // The flags of the next questions: as given at first, without bit 0 once a value input has a
    // default.
    virtual void SetFlags(unsigned int newFlags);
    [[nodiscard]] virtual unsigned int GetFlags() const;

    // How many keywords the question has.
    [[nodiscard]] int GetKeywordCount() const { return keywords.GetCount(); }

protected:
    // `text`, then the keywords in brackets; the keywords alone when it is empty.
    [[nodiscard]] TzString DefaultPrompt(TzString const& text) const;
    [[nodiscard]] TzString DefaultPrompt() const { return DefaultPrompt(promptText); }
    // The same with a default, in angle brackets, before the keywords.
    [[nodiscard]] TzString PromptWithDefault(TzString const& shownDefault) const;

    TzString promptText;  // without default, keywords and colon
    TzString inputText;   // the last text answer
    CKeywordTable keywords;
    unsigned int flags;
    TzString keywordList;
    TzString reserved;  // stays empty
};
