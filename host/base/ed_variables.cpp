#include "tz/ed/variables.h"

#include "host/base/fault_point.h"
#include "host/base/variable_records.h"
#include "host/base/variables.h"
#include "tz/rx/status.h"

int tzedGetVar(wchar_t const* name, resbuf* result) {
    if (auto const fault = tzhost::faultAt("tzedGetVar")) return *fault;
    if (name == nullptr || result == nullptr) return Tzad::ePromptError;
    tzhost::VariableValue const* const value = tzhost::Variables::instance().get(name);
    if (value == nullptr) return Tzad::ePromptError;
    tzhost::toRecord(*value, *result);
    return Tzad::ePromptNormal;
}

int tzedSetVar(wchar_t const* name, resbuf const* value) {
    if (auto const fault = tzhost::faultAt("tzedSetVar")) return *fault;
    if (name == nullptr || value == nullptr) return Tzad::ePromptError;
    auto const held = tzhost::fromRecord(*value);
    if (!held) return Tzad::ePromptError;
    return tzhost::Variables::instance().set(name, *held, tzhost::Writer::module).status;
}
