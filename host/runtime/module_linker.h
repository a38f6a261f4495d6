#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "tz/rx/app.h"
#include "tz/rx/registry.h"

namespace tzhost {

// A loaded module. Its address is the handle that the module gets with message 1.
struct LoadedModule {
    std::filesystem::path file;
    void* loaderHandle = nullptr;  // of dlopen
    TzRxEntryPoint entry = nullptr;
    bool mayUnload = false;
};

// Loads modules, sends them their messages, and unloads them.
class DynamicLinker : public TzRxDynamicLinker {
public:
    bool allowUnload(void* appHandle) override;
    bool declareMultiDocument(void* appHandle) override;

    // Loads a module: message 1, then message 3 for the drawing that is open. On failure, which an
    // exception at either is too, nothing of it stays and `error` says in one line why.
    bool load(std::filesystem::path const& file, std::string& error);
    // Unloads a module by its file name: message 4 for the open drawing, message 2, and its file
    // leaves the process. On failure `error` says why and the module stays.
    bool unload(std::filesystem::path const& file, std::string& error);
    // Unloads all, newest first; a module that may not be unloaded stays.
    void unloadAll();
    // Message 3 or 4 for every module, when a drawing comes or goes.
    void broadcast(TzRx::AppMsgCode message);
    // Sends one message to the module that defined a function.
    [[nodiscard]] int send(LoadedModule const& module, TzRx::AppMsgCode message) const;

    [[nodiscard]] std::vector<std::unique_ptr<LoadedModule>> const& modules() const {
        return modules_;
    }
    // The module whose message is being handled; null outside messages.
    [[nodiscard]] LoadedModule const* active() const { return active_; }

private:
    [[nodiscard]] LoadedModule* byHandle(void* handle) const;
    // Open the module's file and send it its first messages; empty, or what keeps it from being
    // loaded.
    [[nodiscard]] static std::string openingProblem(LoadedModule& module);
    [[nodiscard]] std::string startingProblem(LoadedModule& module) const;
    // Undoes what the newest module's start has reached.
    void dropNewest();
    int deliver(LoadedModule const& module, TzRx::AppMsgCode message, void* argument) const;

    std::vector<std::unique_ptr<LoadedModule>> modules_;
    mutable LoadedModule const* active_ = nullptr;
};

[[nodiscard]] DynamicLinker& dynamicLinker();

}  // namespace tzhost
