#include "tz/ed/jig.h"

#include "host/base/fault_point.h"
#include "host/command_line/jig_driver.h"

TzEdJig::TzEdJig() = default;
TzEdJig::~TzEdJig() = default;

TzEdJig::DragStatus TzEdJig::drag() {
    if (auto const fault = tzhost::faultAt("TzEdJig::drag", kOther)) {
        int const status = tzhost::commandLine().failed(*fault);
        return status == Tzad::ePromptCancel ? kCancel : static_cast<DragStatus>(status);
    }
    return TzEdJigDriver(*this).run();
}

void TzEdJig::setDispPrompt(wchar_t const* prompt) {
    prompt_ = prompt;
}

void TzEdJig::setKeywordList(wchar_t const* keywords) {
    keywords_ = keywords;
}

wchar_t const* TzEdJig::keywordList() const {
    return keywords_.kwszPtr();
}

void TzEdJig::setUserInputControls(UserInputControls controls) {
    controls_ = controls;
}

TzEdJig::UserInputControls TzEdJig::userInputControls() const {
    return controls_;
}

void TzEdJig::setSpecialCursorType(int type) {
    cursorType_ = type;
}

TzEdJig::DragStatus TzEdJig::acquirePoint(TzGePoint3d& point) {
    if (auto const fault = tzhost::faultAt("TzEdJig::acquirePoint", kOther)) {
        return static_cast<DragStatus>(*fault);
    }
    return driver_ != nullptr ? driver_->acquire(point, nullptr) : kOther;
}

TzEdJig::DragStatus TzEdJig::acquirePoint(TzGePoint3d& point, TzGePoint3d const& base) {
    if (auto const fault = tzhost::faultAt("TzEdJig::acquirePoint", kOther)) {
        return static_cast<DragStatus>(*fault);
    }
    return driver_ != nullptr ? driver_->acquire(point, &base) : kOther;
}

TzEdJigInputData const& tzedGetJigInputData(TzEdJig const& jig) {
    return jig.data_;
}
