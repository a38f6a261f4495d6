#include "module/prompt/distance_input.h"

#include "tz/ed/prompts.h"

CTzsDistanceInput::CTzsDistanceInput(unsigned int theFlags,
                                     CKeywordTable& table,
                                     TzString const& prompt,
                                     double const* basePoint)
    : CTzsRealInput(theFlags, table, prompt), basePoint_(basePoint) {}

TzString CTzsDistanceInput::FormattedReal() const {
    return CTzsRealInput::FormattedReal();
}

double CTzsDistanceInput::GetDistance() const {
    return GetReal();
}

int CTzsDistanceInput::OnPrompt(TzString const& prompt) {
    return WithDefault(tzedGetDist(basePoint_.pointer(), prompt, &result_));
}
