#include "host/runtime/module_linker.h"

#include <dlfcn.h>

#include <algorithm>
#include <exception>
#include <utility>

#include "host/base/memory_faults.h"
#include "host/runtime/class_registry.h"
#include "host/runtime/documents.h"
#include "host/text/filled.h"
#include "host/text/local_text.h"
#include "host/text/system_words.h"

namespace tzhost {
namespace {

// Sets a value for the length of a block.
template <class T>
class Restoring {
public:
    Restoring(T& place, T value) : place_(place), before_(std::exchange(place, value)) {}
    Restoring(Restoring const&) = delete;
    Restoring& operator=(Restoring const&) = delete;
    ~Restoring() { place_ = before_; }

private:
    T& place_;
    T before_;
};

// What the loader says in English, in whatever language.
constexpr char const* kLoaderTexts[] = {
    forLocalText("cannot open shared object file: %s"),
    forLocalText("cannot read file data: %s"),
    forLocalText("file too short"),
    forLocalText("invalid ELF header"),
    forLocalText("wrong ELF class: %s"),
    forLocalText("undefined symbol: %s"),
};

std::string inWords(std::string const& part) {
    return localText(part.c_str());
}

// The loader's reason, without the file, which is told anyway, before it.
std::string loaderError(std::filesystem::path const& file) {
    char const* const text = dlerror();
    if (!text) return localText("the dynamic loader gives no reason");
    std::string reason(text);
    std::string const ahead = file.string() + ": ";
    if (reason.starts_with(ahead)) reason.erase(0, ahead.size());
    return localMessage(reason, kLoaderTexts, inWords);
}

}  // namespace

LoadedModule* DynamicLinker::byHandle(void* handle) const {
    auto const at = std::find_if(modules_.begin(), modules_.end(),
                                 [&](auto const& module) { return module.get() == handle; });
    return at == modules_.end() ? nullptr : at->get();
}

bool DynamicLinker::allowUnload(void* appHandle) {
    LoadedModule* const module = byHandle(appHandle);
    if (module) module->mayUnload = true;
    return module != nullptr;
}

bool DynamicLinker::declareMultiDocument(void* appHandle) {
    return byHandle(appHandle) != nullptr;  // one drawing is open at a time
}

int DynamicLinker::deliver(LoadedModule const& module,
                           TzRx::AppMsgCode message,
                           void* argument) const {
    Restoring<LoadedModule const*> const active(active_, &module);
    return module.entry(message, argument);
}

int DynamicLinker::send(LoadedModule const& module, TzRx::AppMsgCode message) const {
    return deliver(module, message, nullptr);
}

std::string DynamicLinker::openingProblem(LoadedModule& module) {
    MemoryFaultPause const pause;  // what the loader runs could not pass a failure on
    module.loaderHandle = dlopen(module.file.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (!module.loaderHandle)
        return localText("the module cannot be loaded") + ": " + loaderError(module.file);
    module.entry = reinterpret_cast<TzRxEntryPoint>(dlsym(module.loaderHandle, "tzrxEntryPoint"));
    if (module.entry) return {};
    dlclose(module.loaderHandle);
    return localText("this is no module of the host: it has no tzrxEntryPoint");
}

// An exception ends here: its type may be the module's, which goes.
std::string DynamicLinker::startingProblem(LoadedModule& module) const {
    try {
        int const status = deliver(module, TzRx::kInitAppMsg, &module);
        if (status == TzRx::kRetOK) {
            if (documents().curDocument())
                (void)send(module, TzRx::kLoadDwgMsg);  // the module stays either way
            return {};
        }
        return TzString::formatted(localText(L"the module refused to start (status %d)"), status)
            .toUtf8();
    } catch (std::exception const& thrown) {
        MemoryFaultPause const pause;
        return localText("the module failed at its start") + ": " + systemWords(thrown);
    } catch (...) {
        MemoryFaultPause const pause;
        return localText("the module failed at its start");
    }
}

void DynamicLinker::dropNewest() {
    MemoryFaultPause const givesBack;
    LoadedModule const& module = *modules_.back();
    try {
        (void)deliver(module, TzRx::kUnloadAppMsg, nullptr);  // safe whatever load reached
    } catch (...) {
        // There is nothing more that it could give back.
    }
    documents().forgetModule(module);
    dlclose(module.loaderHandle);
    modules_.pop_back();
}

bool DynamicLinker::load(std::filesystem::path const& file, std::string& error) {
    auto const sameFile = [&](auto const& module) {
        return module->file.filename() == file.filename();
    };
    if (std::any_of(modules_.begin(), modules_.end(), sameFile)) {
        error = file.string() + ": " + localText("this module is loaded already");
        return false;
    }
    auto module = std::make_unique<LoadedModule>();
    module->file = file;
    modules_.reserve(modules_.size() + 1);
    std::string problem = openingProblem(*module);
    if (problem.empty()) {
        modules_.push_back(std::move(module));
        problem = startingProblem(*modules_.back());
        if (!problem.empty()) dropNewest();
    }
    if (!problem.empty()) error = file.string() + ": " + problem;
    return problem.empty();
}

bool DynamicLinker::unload(std::filesystem::path const& file, std::string& error) {
    auto const at = std::find_if(modules_.begin(), modules_.end(), [&](auto const& module) {
        return module->file.filename() == file.filename();
    });
    if (at == modules_.end()) {
        error = file.string() + ": " + localText("no module of that name is loaded");
        return false;
    }
    LoadedModule const& module = **at;
    if (!module.mayUnload) {
        error = file.string() + ": " + localText("this module does not allow to be unloaded");
        return false;
    }
    if (documents().curDocument()) (void)send(module, TzRx::kUnloadDwgMsg);
    (void)send(module, TzRx::kUnloadAppMsg);
    documents().forgetModule(module);
    dlclose(module.loaderHandle);
    modules_.erase(at);
    return true;
}

void DynamicLinker::unloadAll() {
    for (std::size_t left = modules_.size(); left > 0; --left) {
        std::string ignored;
        (void)unload(modules_[left - 1]->file, ignored);
    }
}

void DynamicLinker::broadcast(TzRx::AppMsgCode message) {
    for (auto const& module : modules_)
        (void)send(*module, message);
}

}  // namespace tzhost

TzRxClass* TzRxDynamicLinker::desc() {
    static TzRxClass* const descriptor =
        tzhost::hostClass(L"TzRxDynamicLinker", TzRxObject::desc());
    return descriptor;
}
TzRxClass* TzRxDynamicLinker::isA() const {
    return desc();
}
