#include "tz/ed/prompt_objects.h"

#include "host/command_line/command_line.h"
#include "tz/ed/prompts.h"
#include "tz/rx/status.h"

void TzEdPromptKeyword::setMessageAndKeywords(wchar_t const* message, wchar_t const* keywords) {
    message_ = message;
    keywords_ = keywords;
}

void TzEdPromptKeyword::setAllowNone(bool allow) {
    allowNone_ = allow;
}

int TzEdPromptKeyword::getKeyword() {
    constexpr int kNoEmptyAnswer = 1;
    result_.setEmpty();
    int const armed = tzedInitGet(allowNone_ ? 0 : kNoEmptyAnswer, keywords_);
    if (armed != Tzad::ePromptNormal) return tzhost::commandLine().failed(armed);
    return tzedGetKword(message_, result_);
}

TzEdPromptAngle::TzEdPromptAngle(wchar_t const* message) : message_(message) {}

void TzEdPromptAngle::setBasePoint(TzGePoint3d const& point) {
    base_ = point;
    hasBase_ = true;
}

void TzEdPromptAngle::setDefaultValue(double radians) {
    default_ = radians;
    hasDefault_ = true;
}

int TzEdPromptAngle::getAngle() {
    int const armed = tzedInitGet(0, nullptr);
    if (armed != Tzad::ePromptNormal) return tzhost::commandLine().failed(armed);
    double const base[3] = {base_.x, base_.y, base_.z};
    double read = 0;
    int const status = tzedGetAngle(hasBase_ ? base : nullptr, message_, &read);
    bool const isDefault = status == Tzad::ePromptNone && hasDefault_;
    if (status == Tzad::ePromptNormal || isDefault) value_ = isDefault ? default_ : read;
    return isDefault ? Tzad::ePromptNormal : status;
}
