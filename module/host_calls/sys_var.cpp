#include "module/host_calls/sys_var.h"

#include "module/host_calls/truncate.h"
#include "tz/ed/variables.h"
#include "tz/ge/point3d.h"
#include "tz/rx/status.h"

namespace {

// A variable as it was read. Releases the string that the host gave, if it gave one.
class VariableValue {
public:
    explicit VariableValue(wchar_t const* name) { (void)tzedGetVar(name, &value); }
    ~VariableValue() {
        if (value.restype == Tzad::eResultString) tzutDelString(value.resval.rstring);
    }
    VariableValue(VariableValue const&) = delete;
    VariableValue& operator=(VariableValue const&) = delete;

    resbuf value{};  // without a type when the variable could not be read
};

bool write(wchar_t const* name, resbuf const& value) {
    return tzedSetVar(name, &value) == Tzad::ePromptNormal;
}

}  // namespace

TzString CTzadSysVar::GetString(wchar_t const* name) {
    VariableValue const read(name);
    resval_u const& value = read.value.resval;
    switch (read.value.restype) {
    case Tzad::eResultReal: return TzString::formatted(L"%g", value.rreal);
    case Tzad::eResultShort: return TzString::formatted(L"%d", static_cast<int>(value.rint));
    case Tzad::eResultLong: return TzString::formatted(L"%d", value.rlong);
    case Tzad::eResultString: return TzString(value.rstring);
    default: return TzString();
    }
}

int CTzadSysVar::GetInt(wchar_t const* name) {
    VariableValue const read(name);
    resval_u const& value = read.value.resval;
    switch (read.value.restype) {
    case Tzad::eResultReal: return truncatedToInt(value.rreal);
    case Tzad::eResultShort: return value.rint;
    case Tzad::eResultLong: return value.rlong;
    default: return 0;
    }
}

double CTzadSysVar::GetDouble(wchar_t const* name) {
    VariableValue const read(name);
    resval_u const& value = read.value.resval;
    switch (read.value.restype) {
    case Tzad::eResultReal: return value.rreal;
    case Tzad::eResultShort: return value.rint;
    case Tzad::eResultLong: return value.rlong;
    default: return 0.0;
    }
}

bool CTzadSysVar::SetInt(wchar_t const* name, int value) {
    resbuf record{};
    record.restype = Tzad::eResultShort;
    record.resval.rint = static_cast<short>(value);
    return write(name, record);
}

bool CTzadSysVar::SetDouble(wchar_t const* name, double value) {
    resbuf record{};
    record.restype = Tzad::eResultReal;
    record.resval.rreal = value;
    return write(name, record);
}

bool CTzadSysVar::SetPoint(wchar_t const* name, TzGePoint3d const& point) {
    resbuf record{};
    record.restype = Tzad::eResultPoint3d;
    record.resval.rpoint[0] = point.x;
    record.resval.rpoint[1] = point.y;
    record.resval.rpoint[2] = point.z;
    return write(name, record);
}
