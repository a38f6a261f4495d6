#include "tz/ed/variables.h"

#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "host/settings/variable_json.h"
#include "host/settings/variable_records.h"
#include "host/settings/variables.h"
#include "host/text/utf8.h"
#include "tz/rx/status.h"

namespace {

void reportWrite(wchar_t const* name, tzhost::VariableValue const& value) {
    tzhost::reportEvent([&] {
        std::wstring const capitals(tzhost::findVariable(name)->name);
        return tzhost::Event{{"event", "variable"},
                             {"name", tzhost::toUtf8(capitals)},
                             {"value", tzhost::toJson(value)}};
    });
}

}  // namespace

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
    auto const written = tzhost::Variables::instance().set(name, *held, tzhost::Writer::module);
    if (written.isDone()) reportWrite(name, *held);
    return written.status;
}
