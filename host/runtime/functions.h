#pragma once

#include <vector>

#include "tz/ed/functions.h"
#include "tz/text/string.h"

namespace tzhost {

struct LoadedModule;

// A function that a module defined for a drawing.
struct DefinedFunction {
    TzString name;
    int code = 0;
    LoadedModule const* module = nullptr;
};

// The functions of one drawing.
class FunctionTable {
public:
    // False when the name is empty or defined already.
    bool define(TzString const& name, int code, LoadedModule const* module);
    bool undefine(TzString const& name, int code);
    void forgetModule(LoadedModule const& module);
    // Without regard to case; null when there is none.
    [[nodiscard]] DefinedFunction const* find(TzString const& name) const;

private:
    std::vector<DefinedFunction> functions_;
};

// Calls a function of the current drawing: message 5 to its module, with the arguments, which stay
// the caller's. The module's answer, or -1 when there is no such function.
[[nodiscard]] int callFunction(TzString const& name, resbuf* arguments);

}  // namespace tzhost
