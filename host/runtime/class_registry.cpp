#include "host/runtime/class_registry.h"

#include <cstdio>
#include <cstdlib>
#include <map>
#include <memory>
#include <string>
#include <utility>

#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "tz/text/string.h"

namespace tzhost {
namespace {

class ClassDescriptor : public TzRxClass {
public:
    ClassDescriptor(std::wstring name, std::wstring parentName, TzRxCreator creator)
        : name_(std::move(name)), parentName_(std::move(parentName)), creator_(creator) {}

    [[nodiscard]] wchar_t const* name() const override { return name_.c_str(); }
    [[nodiscard]] TzRxClass* myParent() const override { return parent_; }
    [[nodiscard]] bool isDerivedFrom(TzRxClass const* other) const override;
    [[nodiscard]] TzRxObject* create() const override { return creator_ ? creator_() : nullptr; }
    TzRxObject* addX(TzRxClass const* face, TzRxObject* extension) override;
    TzRxObject* delX(TzRxClass const* face) override;
    [[nodiscard]] TzRxObject* getX(TzRxClass const* face) const override;

    void connect(TzRxClass* parent) { parent_ = parent; }
    [[nodiscard]] std::wstring const& parentName() const { return parentName_; }

private:
    std::wstring name_;
    std::wstring parentName_;
    TzRxCreator creator_;
    TzRxClass* parent_ = nullptr;  // of the registry; null for the root and before it is connected
    std::map<TzRxClass const*, TzRxObject*> extensions_;  // not owned
};

bool ClassDescriptor::isDerivedFrom(TzRxClass const* other) const {
    for (TzRxClass const* each = this; other && each; each = each->myParent()) {
        if (each == other) return true;
    }
    return false;
}

TzRxObject* ClassDescriptor::addX(TzRxClass const* face, TzRxObject* extension) {
    TzRxObject* const before = delX(face);
    extensions_[face] = extension;
    return before;
}

TzRxObject* ClassDescriptor::delX(TzRxClass const* face) {
    TzRxObject* const before = getX(face);
    extensions_.erase(face);
    return before;
}

TzRxObject* ClassDescriptor::getX(TzRxClass const* face) const {
    auto const at = extensions_.find(face);
    return at == extensions_.end() ? nullptr : at->second;
}

using Classes = std::map<std::wstring, std::unique_ptr<ClassDescriptor>, std::less<>>;

Classes& classes() {
    static Classes all;
    return all;
}

// The new descriptor, or null when the name is taken.
ClassDescriptor* insertClass(wchar_t const* name, wchar_t const* parent, TzRxCreator creator) {
    std::wstring const key(name ? name : L"");
    auto made = std::make_unique<ClassDescriptor>(key, parent ? parent : L"", creator);
    auto const [at, isNew] = classes().try_emplace(key, std::move(made));
    return isNew ? at->second.get() : nullptr;
}

void reportClass(wchar_t const* name, bool on) {
    reportEvent([&] {
        return Event{{"event", "register"}, {"what", "class"}, {"name", utf8(name)}, {"on", on}};
    });
}

}  // namespace

TzRxClass* hostClass(wchar_t const* name, TzRxClass* parent, TzRxCreator creator) {
    ClassDescriptor* const made = insertClass(name, parent ? parent->name() : nullptr, creator);
    if (!made) tzrx_abort(L"A class of the host is registered twice");
    made->connect(parent);
    return made;
}

}  // namespace tzhost

TzRxClass* newTzRxClass(wchar_t const* name,
                        wchar_t const* parent,
                        int /*proxyFlags*/,
                        TzRxCreator creator,
                        wchar_t const* /*dxfName*/,
                        wchar_t const* /*appName*/) {
    if (tzhost::faultAt("newTzRxClass")) return nullptr;
    TzRxClass* const made = tzhost::insertClass(name, parent, creator);
    if (made) tzhost::reportClass(made->name(), true);
    return made;
}

void deleteTzRxClass(TzRxClass* descriptor) {
    if (!descriptor) return;
    tzhost::reportClass(descriptor->name(), false);
    tzhost::classes().erase(descriptor->name());
}

TzRxClass* tzrxFindTzRxClass(wchar_t const* name) {
    auto const at = tzhost::classes().find(std::wstring_view(name ? name : L""));
    return at == tzhost::classes().end() ? nullptr : at->second.get();
}

void tzrxBuildClassHierarchy() {
    for (auto const& [name, descriptor] : tzhost::classes()) {
        if (!descriptor->myParent() && descriptor.get() != TzRxObject::desc()) {
            descriptor->connect(tzrxFindTzRxClass(descriptor->parentName().c_str()));
        }
    }
}

void tzrx_abort(wchar_t const* text) {
    std::fprintf(stderr, "%s\n", TzString(text).toUtf8().c_str());
    std::abort();
}

TzRxClass* TzRxObject::desc() {
    static TzRxClass* const descriptor = tzhost::hostClass(L"TzRxObject", nullptr);
    return descriptor;
}

TzRxClass* TzRxObject::isA() const {
    return desc();
}

bool TzRxObject::isKindOf(TzRxClass const* other) const {
    return isA() && isA()->isDerivedFrom(other);
}

TzRxObject* TzRxObject::queryX(TzRxClass const* other) const {
    for (TzRxClass const* each = isA(); each; each = each->myParent()) {
        if (TzRxObject* const extension = each->getX(other)) return extension;
    }
    return nullptr;
}
