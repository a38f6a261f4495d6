#include "module/prompt/angle_input.h"

#include "module/host_calls/unit_converter.h"
#include "tz/ed/prompts.h"

CTzsAngleInput::CTzsAngleInput(unsigned int theFlags,
                               CKeywordTable& table,
                               TzString const& prompt,
                               double const* basePoint)
    : CTzsRealInput(theFlags, table, prompt), basePoint_(basePoint) {}

TzString CTzsAngleInput::FormattedReal() const {
    return CRadialUnitConverter(kRadialUnitsOfDrawing, kPrecisionOfDrawing)
        .MapDoubleToUnit(GetDefault());
}

double CTzsAngleInput::GetAngle() const {
    return GetReal();
}

int CTzsAngleInput::OnPrompt(TzString const& prompt) {
    return WithDefault(tzedGetAngle(basePoint_.pointer(), prompt, &result_));
}

int CTzsOrientationInput::OnPrompt(TzString const& prompt) {
    return WithDefault(tzedGetOrient(basePoint_.pointer(), prompt, &result_));
}
