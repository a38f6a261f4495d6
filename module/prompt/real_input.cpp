#include "module/prompt/real_input.h"

#include "module/host_calls/unit_converter.h"
#include "tz/ed/prompts.h"

void CTzsRealInput::SetDefault(double value) {
    default_ = value;
    hasDefault_ = true;
    SetFlags(GetFlags() & ~1U);
}

double CTzsRealInput::GetReal() const {
    return result_;
}

TzString CTzsRealInput::FormattedReal() const {
    return CLinearUnitConverter(kLinearUnitsOfDrawing, kPrecisionOfDrawing)
        .MapDoubleToUnit(GetDefault());
}

double CTzsRealInput::GetDefault() const {
    return default_;
}

bool CTzsRealInput::HasDefault() const {
    return hasDefault_;
}

TzString CTzsRealInput::PromptString() const {
    return HasDefault() ? PromptWithDefault(FormattedReal()) : DefaultPrompt();
}

int CTzsRealInput::OnPrompt(TzString const& prompt) {
    return WithDefault(tzedGetReal(prompt, &result_));
}

int CTzsRealInput::WithDefault(int status) {
    if (status == statusNone && HasDefault()) result_ = GetDefault();
    return status;
}
