#pragma once

#include "tz/export.h"
#include "tz/ge/point3d.h"
#include "tz/text/string.h"

// Two questions as objects, for callers that ask the same thing again or read the answer later.
// They keep to the same statuses, flags and keywords as tz/ed/prompts.h.
//
//   TzEdPromptKeyword prompt;
//   prompt.setMessageAndKeywords(L"Change [Style/Rotate]", L"Style Rotate");
//   if (prompt.getKeyword() == 5100 && prompt.resultString() == L"Style") ...
class TZ_API TzEdPromptKeyword {
public:
    // The prompt and its keyword list, in the form that tzedInitGet takes.
    void setMessageAndKeywords(wchar_t const* message, wchar_t const* keywords);
    // An empty answer is taken unless this says no.
    void setAllowNone(bool allow);
    // [command] Asks once; the status.
    [[nodiscard]] int getKeyword();
    // The global word of the last answer, empty without one.
    [[nodiscard]] TzString const& resultString() const { return result_; }

private:
    TzString message_;
    TzString keywords_;
    TzString result_;
    bool allowNone_ = true;
};

//   TzEdPromptAngle prompt(L"Rotation <0>: ");
//   if (prompt.getAngle() == 5100) use(prompt.value());
class TZ_API TzEdPromptAngle {
public:
    explicit TzEdPromptAngle(wchar_t const* message);
    void setMessage(wchar_t const* message) { message_ = message; }
    // User coordinates, for angles given by one point.
    void setBasePoint(TzGePoint3d const& point);
    // An empty answer gives 5100 and this value, in radians.
    void setDefaultValue(double radians);
    // [command] Asks once; the status.
    [[nodiscard]] int getAngle();
    // Radians; 0 before the first 5100.
    [[nodiscard]] double value() const { return value_; }

private:
    TzString message_;
    TzGePoint3d base_;
    double default_ = 0;
    double value_ = 0;
    bool hasBase_ = false;
    bool hasDefault_ = false;
};
