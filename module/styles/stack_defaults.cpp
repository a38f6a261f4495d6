#include "module/styles/stack_defaults.h"

#include "module/host_calls/sys_var.h"

int GetDefaultStackScale() {
    return CTzadSysVar::GetInt(L"TSTACKSIZE");
}

bool SetDefaultStackScale(int percent) {
    return CTzadSysVar::SetInt(L"TSTACKSIZE", percent);
}

VerticalAlignment GetDefaultStackAlignment() {
    return static_cast<VerticalAlignment>(CTzadSysVar::GetInt(L"TSTACKALIGN"));
}

bool SetDefaultStackAlignment(VerticalAlignment alignment) {
    return CTzadSysVar::SetInt(L"TSTACKALIGN", alignment);
}
