#include "host/runtime/functions.h"

#include <algorithm>

#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "host/runtime/documents.h"
#include "host/runtime/module_linker.h"
#include "tz/rx/status.h"

namespace tzhost {
namespace {

// The call that message 5 is about.
struct Call {
    int code = 0;
    resbuf* arguments = nullptr;
    Call* outer = nullptr;
};
Call* currentCall = nullptr;

class CallScope {
public:
    CallScope(int code, resbuf* arguments) : call_{code, arguments, currentCall} {
        currentCall = &call_;
    }
    CallScope(CallScope const&) = delete;
    CallScope& operator=(CallScope const&) = delete;
    ~CallScope() { currentCall = call_.outer; }

private:
    Call call_;
};

void reportFunction(TzString const& name, int code, bool on) {
    reportEvent([&] {
        return Event{{"event", "register"},
                     {"what", "function"},
                     {"name", utf8(name)},
                     {"on", on},
                     {"code", code}};
    });
}

}  // namespace

bool FunctionTable::define(TzString const& name, int code, LoadedModule const* module) {
    if (name.isEmpty() || find(name)) return false;
    functions_.push_back({name, code, module});
    return true;
}

bool FunctionTable::undefine(TzString const& name, int code) {
    return std::erase_if(functions_, [&](DefinedFunction const& each) {
               return each.code == code && each.name.compareNoCase(name) == 0;
           }) > 0;
}

void FunctionTable::forgetModule(LoadedModule const& module) {
    std::erase_if(functions_, [&](DefinedFunction const& each) { return each.module == &module; });
}

DefinedFunction const* FunctionTable::find(TzString const& name) const {
    auto const at =
        std::find_if(functions_.begin(), functions_.end(), [&](DefinedFunction const& each) {
            return each.name.compareNoCase(name) == 0;
        });
    return at == functions_.end() ? nullptr : &*at;
}

int callFunction(TzString const& name, resbuf* arguments) {
    Document const* const document = documents().current();
    DefinedFunction const* const function = document ? document->functions.find(name) : nullptr;
    if (!function || !function->module) return -1;
    CallScope const scope(function->code, arguments);
    return dynamicLinker().send(*function->module, TzRx::kInvkSubrMsg);
}

}  // namespace tzhost

int tzedDefun(wchar_t const* name, int code) {
    if (auto const fault = tzhost::faultAt("tzedDefun")) return *fault;
    tzhost::Document* const document = tzhost::documents().current();
    if (!document || !document->functions.define(name, code, tzhost::dynamicLinker().active())) {
        return Tzad::ePromptError;
    }
    tzhost::reportFunction(name, code, true);
    return Tzad::ePromptNormal;
}

int tzedUndef(wchar_t const* name, int code) {
    tzhost::Document* const document = tzhost::documents().current();
    bool const undefined = document && document->functions.undefine(name, code);
    if (undefined) tzhost::reportFunction(name, code, false);
    if (auto const fault = tzhost::faultAt("tzedUndef")) return *fault;
    return undefined ? Tzad::ePromptNormal : Tzad::ePromptError;
}

int tzedGetFunCode() {
    if (auto const fault = tzhost::faultAt("tzedGetFunCode")) return *fault;
    return tzhost::currentCall ? tzhost::currentCall->code : Tzad::ePromptError;
}

resbuf* tzedGetArgs() {
    if (tzhost::faultAt("tzedGetArgs")) return nullptr;
    return tzhost::currentCall ? tzhost::currentCall->arguments : nullptr;
}

int tzedRetVoid() {
    if (auto const fault = tzhost::faultAt("tzedRetVoid")) return *fault;
    return tzhost::currentCall ? Tzad::ePromptNormal : Tzad::ePromptError;
}
