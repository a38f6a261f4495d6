#include "host/runtime/dictionary.h"

#include <string_view>

#include "host/base/event_sink.h"
#include "host/runtime/class_registry.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/module_linker.h"

namespace tzhost {

TzRxObject* Dictionary::at(wchar_t const* name) const {
    auto const found = objects_.find(std::wstring_view(name ? name : L""));
    return found == objects_.end() ? nullptr : found->second.get();
}

TzRxObject* Dictionary::atPut(wchar_t const* name, TzRxObject* object) {
    std::unique_ptr<TzRxObject>& place = objects_[name ? name : L""];
    TzRxObject* const before = place.release();
    place.reset(object);
    return before;
}

TzRxObject* Dictionary::remove(wchar_t const* name) {
    auto const found = objects_.find(std::wstring_view(name ? name : L""));
    if (found == objects_.end()) return nullptr;
    TzRxObject* const object = found->second.release();
    objects_.erase(found);
    return object;
}

namespace {

// The service dictionary reports what comes and goes.
class ServiceDictionary : public Dictionary {
public:
    TzRxObject* remove(wchar_t const* name) override {
        TzRxObject* const removed = Dictionary::remove(name);
        if (removed) {
            reportEvent([&] {
                return Event{{"event", "register"},
                             {"what", "service"},
                             {"name", utf8(name)},
                             {"on", false}};
            });
        }
        return removed;
    }
};

class Service : public TzRxObject {};

Dictionary& systemRegistry() {
    static Dictionary registry = [] {
        Dictionary made;
        made.atPut(L"DynamicLinker", new DynamicLinker);
        made.atPut(L"ServiceDictionary", new ServiceDictionary);
        made.atPut(L"TZAD_REGISTERED_COMMANDS", new CommandStack);
        return made;
    }();
    return registry;
}

}  // namespace

Dictionary& serviceDictionary() {
    return static_cast<Dictionary&>(*systemRegistry().at(L"ServiceDictionary"));
}

CommandStack& commandStack() {
    return static_cast<CommandStack&>(*systemRegistry().at(L"TZAD_REGISTERED_COMMANDS"));
}

DynamicLinker& dynamicLinker() {
    return static_cast<DynamicLinker&>(*systemRegistry().at(L"DynamicLinker"));
}

}  // namespace tzhost

TzRxDictionary* tzrxSysRegistry() {
    return &tzhost::systemRegistry();
}

TzRxObject* tzrxRegisterService(wchar_t const* name) {
    tzhost::Dictionary& services = tzhost::serviceDictionary();
    if (TzRxObject* const there = services.at(name)) return there;
    TzRxObject* const service = new tzhost::Service;
    services.atPut(name, service);
    tzhost::reportEvent([&] {
        return tzhost::Event{
            {"event", "register"}, {"what", "service"}, {"name", tzhost::utf8(name)}, {"on", true}};
    });
    return service;
}

TzRxClass* TzRxDictionary::desc() {
    static TzRxClass* const descriptor = tzhost::hostClass(L"TzRxDictionary", TzRxObject::desc());
    return descriptor;
}
TzRxClass* TzRxDictionary::isA() const {
    return desc();
}
