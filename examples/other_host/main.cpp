// The smallest program that lives with the text module, made from the headers of sdk/ alone: it
// loads the module, prints the commands that this brings, and unloads it again. Its linker and its
// command stack are its own; all other operations are still those of libtz.so.1.
//
//   other_host tzmted.tzx

#include <dlfcn.h>

#include <cstdio>
#include <map>
#include <string>

#include "tz/ed/command_stack.h"
#include "tz/rx/app.h"
#include "tz/rx/registry.h"

namespace {

// The module says of itself that it may be unloaded and serves several drawings. A host that keeps
// one module knows no other handle.
class Linker : public TzRxDynamicLinker {
public:
    explicit Linker(void* module) : module_(module) {}
    bool allowUnload(void* handle) override { return handle == module_; }
    bool declareMultiDocument(void* handle) override { return handle == module_; }

private:
    void* module_;
};

// Commands by their global names.
class Commands : public TzEdCommandStack {
public:
    int addCommand(wchar_t const* group,
                   wchar_t const* globalName,
                   wchar_t const* localName,
                   int flags,
                   Callback callback,
                   TzRxObject* /*reactor*/,
                   int /*sequence*/,
                   TzRxResourceInstance const& /*resources*/,
                   void* /*data*/) override {
        std::printf("+ %ls (%ls) of %ls, flags 0x%x\n", globalName, localName, group,
                    static_cast<unsigned int>(flags));
        bodies_[globalName] = callback;  // what a host calls to run it
        return 0;
    }
    int removeGroup(wchar_t const* group) override {
        std::printf("- %ls\n", group);
        bodies_.clear();
        return 0;
    }

private:
    std::map<std::wstring, Callback> bodies_;
};

// Puts an object in the place of the host's own.
void replace(wchar_t const* name, TzRxObject* object) {
    delete tzrxSysRegistry()->atPut(name, object);
}

}  // namespace

int main(int count, char** arguments) {
    char const* const file = count > 1 ? arguments[1] : "tzmted.tzx";
    void* const module = dlopen(file, RTLD_NOW | RTLD_LOCAL);
    auto const send =
        module ? reinterpret_cast<TzRxEntryPoint>(dlsym(module, "tzrxEntryPoint")) : nullptr;
    if (!send) {
        std::fprintf(stderr, "%s: no module\n", file);
        return 2;
    }
    replace(L"DynamicLinker", new Linker(module));
    replace(L"TZAD_REGISTERED_COMMANDS", new Commands);
    int const status = send(TzRx::kInitAppMsg, module);
    std::printf("started with %d\n", status);
    send(TzRx::kUnloadAppMsg, nullptr);  // safe whatever the start reached
    dlclose(module);
    bool const isGone = dlopen(file, RTLD_NOW | RTLD_NOLOAD) == nullptr;
    std::printf("the file is %s\n", isGone ? "gone from the process" : "still there");
    return status == TzRx::kRetOK && isGone ? 0 : 1;
}
