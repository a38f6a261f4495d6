#include <algorithm>
#include <vector>

#include "host/base/fault_point.h"
#include "host/settings/variables.h"
#include "tz/ed/variables.h"
#include "tz/rx/variables.h"

namespace {

// Looks the value up at each read, so that later changes show.
class Variable : public TzRxVariable {
public:
    explicit Variable(tzhost::VariableDefinition const& row) : row_(row) {}
    [[nodiscard]] wchar_t const* name() const override { return row_.name.data(); }
    [[nodiscard]] int getValue(resbuf* result) const override { return tzedGetVar(name(), result); }
    [[nodiscard]] int intValue() const override {
        return static_cast<int>(std::clamp(tzhost::Variables::instance().number(row_.name),
                                           -2147483648.0, 2147483647.0));
    }

private:
    tzhost::VariableDefinition const& row_;
};

}  // namespace

TzRxVariablesDictionary* TzRxVariablesDictionary::get() {
    static TzRxVariablesDictionary dictionary;
    return &dictionary;
}

TzRxVariable const* TzRxVariablesDictionary::getVariable(wchar_t const* name) const {
    if (tzhost::faultAt("TzRxVariablesDictionary::getVariable")) return nullptr;
    static std::vector<Variable> const variables(tzhost::variableTable().begin(),
                                                 tzhost::variableTable().end());
    tzhost::VariableDefinition const* const row = name ? tzhost::findVariable(name) : nullptr;
    if (row == nullptr) return nullptr;
    return &variables[static_cast<std::size_t>(row - tzhost::variableTable().data())];
}
