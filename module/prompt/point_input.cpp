#include "module/prompt/point_input.h"

#include <algorithm>

#include "tz/ed/prompts.h"
#include "tz/ed/ucs.h"

BasePoint::BasePoint(double const* point) : isGiven_(point != nullptr) {
    if (point) std::copy_n(point, 3, point_);
}

CTzsPointInput::CTzsPointInput(unsigned int theFlags,
                               CKeywordTable& table,
                               TzString const& prompt,
                               double const* basePoint)
    : CTzsInput(theFlags, table, prompt), basePoint_(basePoint) {}

void CTzsPointInput::GetPoint(double* point) const {
    std::copy_n(result_, 3, point);
}

void CTzsPointInput::GetPointInWorldCS(double* point) const {
    GetPoint(point);
    (void)tzdbUcs2Wcs(point, point, false);  // if refused, they stay user coordinates
}

TzString CTzsPointInput::PromptString() const {
    return DefaultPrompt();
}

int CTzsPointInput::OnPrompt(TzString const& prompt) {
    return tzedGetPoint(basePoint_.pointer(), prompt, result_);
}
