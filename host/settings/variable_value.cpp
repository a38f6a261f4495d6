#include "host/settings/variable_value.h"

#include <charconv>
#include <cmath>
#include <limits>
#include <type_traits>

namespace tzhost {

namespace {

std::optional<short> readShort(std::wstring_view text) {
    std::optional<double> const number = readReal(text);
    if (!number || *number != std::trunc(*number)) return std::nullopt;
    constexpr std::numeric_limits<short> kLimits;
    if (*number < kLimits.min() || *number > kLimits.max()) return std::nullopt;
    if (text.find_first_not_of(L"+-0123456789") != text.npos) return std::nullopt;
    return static_cast<short>(*number);
}

std::optional<VariablePoint> readPoint(std::wstring_view text) {
    VariablePoint point{};
    for (std::size_t axis = 0; axis < point.size(); ++axis) {
        std::size_t const comma = text.find(L',');
        std::optional<double> const number = readReal(text.substr(0, comma));
        if (!number) return std::nullopt;
        point[axis] = *number;
        if (comma == text.npos) return axis == 0 ? std::nullopt : std::optional(point);
        text.remove_prefix(comma + 1);
    }
    return std::nullopt;
}

template <class Value>
std::optional<VariableValue> widened(std::optional<Value> const& value) {
    if (!value) return std::nullopt;
    return VariableValue(*value);
}

}  // namespace

VariableType typeOf(VariableValue const& value) {
    return static_cast<VariableType>(value.index());
}

std::optional<double> readReal(std::wstring_view text) {
    if (text.size() > 1 && text[0] == L'+' && text[1] != L'-') text.remove_prefix(1);
    std::string narrow;
    for (wchar_t const c : text) {
        if (c <= 0 || c >= 0x80) return std::nullopt;
        narrow += static_cast<char>(c);
    }
    double value = 0;
    char const* const end = narrow.data() + narrow.size();
    auto const [at, error] = std::from_chars(narrow.data(), end, value);
    if (error != std::errc{} || at != end || !std::isfinite(value)) return std::nullopt;
    return value;
}

std::wstring writeReal(double value) {
    std::array<char, 32> room;
    auto const [end, error] = std::to_chars(room.data(), room.data() + room.size(), value);
    return error == std::errc{} ? std::wstring(room.data(), end) : std::wstring();
}

std::optional<VariableValue> readValue(VariableType type, std::wstring_view text) {
    switch (type) {
    case VariableType::shortInteger: return widened(readShort(text));
    case VariableType::real: return widened(readReal(text));
    case VariableType::point: return widened(readPoint(text));
    case VariableType::text: break;
    }
    return VariableValue(std::wstring(text));
}

std::wstring writeValue(VariableValue const& value) {
    return std::visit(
        [](auto const& held) -> std::wstring {
            using Held = std::decay_t<decltype(held)>;
            if constexpr (std::is_same_v<Held, short>) {
                return std::to_wstring(held);
            } else if constexpr (std::is_same_v<Held, double>) {
                return writeReal(held);
            } else if constexpr (std::is_same_v<Held, std::wstring>) {
                return held;
            } else {
                return writeReal(held[0]) + L',' + writeReal(held[1]) + L',' + writeReal(held[2]);
            }
        },
        value);
}

}  // namespace tzhost
