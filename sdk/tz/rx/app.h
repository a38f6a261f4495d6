#pragma once

// What the host and a loadable module say to each other. The module exports, with C linkage,
//
//   int tzrxEntryPoint(TzRx::AppMsgCode message, void* argument);
//
// and the host sends every message through it, on its one thread.
namespace TzRx {

enum AppMsgCode : int {
    kInitAppMsg = 1,    // loaded; the argument is the module's handle
    kUnloadAppMsg = 2,  // about to be unloaded
    kLoadDwgMsg = 3,    // a drawing has been opened, or was open when the module was loaded
    kUnloadDwgMsg = 4,  // a drawing is going away
    kInvkSubrMsg = 5,   // the interpreter calls a function that the module defined
};

enum AppRetCode : int { kRetOK = 0, kRetError = 3 };

}  // namespace TzRx

using TzRxEntryPoint = int (*)(TzRx::AppMsgCode message, void* argument);
