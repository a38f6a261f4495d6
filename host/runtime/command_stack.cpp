#include "host/runtime/command_stack.h"

#include <algorithm>

#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "host/runtime/class_registry.h"
#include "tz/rx/status.h"

namespace tzhost {
namespace {

struct NoCaseLess {
    bool operator()(TzString const& a, TzString const& b) const { return a.compareNoCase(b) < 0; }
};

std::map<TzString, TzString, NoCaseLess>& helpTopics() {
    static std::map<TzString, TzString, NoCaseLess> topics;
    return topics;
}

void reportCommand(Command const& command, bool on) {
    reportEvent([&] {
        return Event{{"event", "register"},
                     {"what", "command"},
                     {"name", utf8(command.globalName)},
                     {"on", on},
                     {"local", utf8(command.localName)},
                     {"group", utf8(command.group)},
                     {"flags", command.flags}};
    });
}

}  // namespace

int CommandStack::addCommand(wchar_t const* group,
                             wchar_t const* globalName,
                             wchar_t const* localName,
                             int flags,
                             Callback callback,
                             TzRxObject* /*reactor*/,
                             int /*sequence*/,
                             TzRxResourceInstance const& /*resources*/,
                             void* /*data*/) {
    if (auto const fault = faultAt("TzEdCommandStack::addCommand", Tzad::eInvalidInput))
        return *fault;
    Command const command{group, globalName, localName, flags, callback};
    if (command.globalName.isEmpty() || !callback) return Tzad::eInvalidInput;
    auto const sameName = [&](Command const& other) {
        return other.globalName.compareNoCase(command.globalName) == 0;
    };
    if (std::any_of(commands_.begin(), commands_.end(), sameName)) return Tzad::eDuplicateKey;
    commands_.push_back(command);
    reportCommand(command, true);
    return Tzad::eOk;
}

int CommandStack::removeGroup(wchar_t const* group) {
    TzString const name(group);
    bool found = false;
    for (auto at = commands_.begin(); at != commands_.end();) {
        if (at->group != name) {
            ++at;
            continue;
        }
        reportCommand(*at, false);
        at = commands_.erase(at);
        found = true;
    }
    return found ? Tzad::eOk : Tzad::eKeyNotFound;
}

Command const* CommandStack::find(TzString const& typed) const {
    int start = 0;
    bool globalOnly = false;
    for (; typed.getAt(start) == L'_' || typed.getAt(start) == L'.'; ++start) {
        globalOnly = globalOnly || typed.getAt(start) == L'_';
    }
    TzString const name = typed.mid(start);
    auto const firstWith = [&](TzString Command::*which) -> Command const* {
        auto const at =
            std::find_if(commands_.begin(), commands_.end(), [&](Command const& command) {
                return !(command.*which).isEmpty() && (command.*which).compareNoCase(name) == 0;
            });
        return at == commands_.end() ? nullptr : &*at;
    };
    if (Command const* const local = globalOnly ? nullptr : firstWith(&Command::localName))
        return local;
    return firstWith(&Command::globalName);
}

TzString const* findHelp(TzString const& name) {
    auto const at = helpTopics().find(name);
    return at == helpTopics().end() ? nullptr : &at->second;
}

}  // namespace tzhost

int tzedSetFunHelp(wchar_t const* name,
                   wchar_t const* /*file*/,
                   wchar_t const* topic,
                   int /*command*/) {
    if (auto const fault = tzhost::faultAt("tzedSetFunHelp")) return *fault;
    if (!name || !*name) return Tzad::ePromptError;
    tzhost::helpTopics()[name] = topic;
    tzhost::reportEvent([&] {
        return tzhost::Event{{"event", "register"},
                             {"what", "help"},
                             {"name", tzhost::utf8(name)},
                             {"on", true},
                             {"topic", tzhost::utf8(topic)}};
    });
    return Tzad::ePromptNormal;
}

TzRxClass* TzEdCommandStack::desc() {
    static TzRxClass* const descriptor = tzhost::hostClass(L"TzEdCommandStack", TzRxObject::desc());
    return descriptor;
}
TzRxClass* TzEdCommandStack::isA() const {
    return desc();
}
