#include "host/settings/variable_records.h"

#include <algorithm>

namespace tzhost {

void toRecord(VariableValue const& value, resbuf& record) {
    switch (typeOf(value)) {
    case VariableType::shortInteger:
        record.restype = Tzad::eResultShort;
        record.resval.rint = std::get<short>(value);
        break;
    case VariableType::real:
        record.restype = Tzad::eResultReal;
        record.resval.rreal = std::get<double>(value);
        break;
    case VariableType::text:
        record.resval.rstring = tzutNewString(std::get<std::wstring>(value).c_str());
        record.restype = Tzad::eResultString;
        break;
    case VariableType::point: {
        VariablePoint const& point = std::get<VariablePoint>(value);
        record.restype = Tzad::eResultPoint3d;
        std::copy(point.begin(), point.end(), record.resval.rpoint);
        break;
    }
    }
}

std::optional<VariableValue> fromRecord(resbuf const& record) {
    switch (record.restype) {
    case Tzad::eResultShort: return record.resval.rint;
    case Tzad::eResultReal: return record.resval.rreal;
    case Tzad::eResultString:
        return std::wstring(record.resval.rstring ? record.resval.rstring : L"");
    case Tzad::eResultPoint3d: {
        double const* const point = record.resval.rpoint;
        return VariablePoint{point[0], point[1], point[2]};
    }
    default: return std::nullopt;
    }
}

}  // namespace tzhost
