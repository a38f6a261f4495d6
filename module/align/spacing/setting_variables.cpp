#include "module/align/spacing/setting_variables.h"

#include "module/host_calls/sys_var.h"
#include "tz/ed/variables.h"
#include "tz/rx/status.h"

namespace {

// The variable when it has that type; otherwise a value without a type. The string of a variable of
// another type is released.
resbuf valueOfType(wchar_t const* name, short type) {
    resbuf value{};
    if (tzedGetVar(name, &value) != Tzad::ePromptNormal) return {};
    if (value.restype == type) return value;
    if (value.restype == Tzad::eResultString) tzutDelString(value.resval.rstring);
    return {};
}

}  // namespace

int getSysVarInt16(wchar_t const* name, int defaultValue) {
    resbuf const value = valueOfType(name, Tzad::eResultShort);
    return value.restype ? value.resval.rint : defaultValue;
}

bool setSysVarInt16(wchar_t const* name, int value) {
    return CTzadSysVar::SetInt(name, value);
}

double getSysVarDouble(wchar_t const* name, double defaultValue) {
    resbuf const value = valueOfType(name, Tzad::eResultReal);
    return value.restype ? value.resval.rreal : defaultValue;
}

bool setSysVarDouble(wchar_t const* name, double value) {
    return CTzadSysVar::SetDouble(name, value);
}
