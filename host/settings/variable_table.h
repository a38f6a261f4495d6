#pragma once

// The system variables: one row each with its type, default, limits and where its value is kept.
// The values themselves are in host/settings/variables.h.

#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "host/settings/variable_value.h"

namespace tzhost {

enum class KeptIn { drawing, user, session };

// Which values a variable takes besides those of its type. Reals and points are always finite.
enum class Limit {
    none,
    between,  // low to high, both included
    above,    // more than low
    least,    // low or more
    nonZero,  // a direction: not 0,0,0
};

enum class Access { readWrite, readOnly };

struct VariableDefinition {
    std::wstring_view name;  // in capitals
    VariableType type;
    double number;           // the default of shorts and reals, and the z of points
    std::wstring_view text;  // the default of texts
    Limit limit;
    double low;
    double high;
    KeptIn kept;
    Access access;

    [[nodiscard]] VariableValue defaultValue() const;
    // What is wrong with a value, as a sentence's end such as "takes a whole number from 0 to 1";
    // nothing when the variable may hold it. Says nothing about read-only variables.
    [[nodiscard]] std::optional<std::wstring> complaintAbout(VariableValue const& value) const;
    // The values that the variable takes: "a whole number from 0 to 1".
    [[nodiscard]] std::wstring takes() const;
};

// All variables, sorted by name.
[[nodiscard]] std::span<VariableDefinition const> variableTable();

// The row of that name, without regard to case; null when there is none.
[[nodiscard]] VariableDefinition const* findVariable(std::wstring_view name);

}  // namespace tzhost
