#include "host/command_line/point_input.h"

#include <array>
#include <cmath>

#include "host/command_line/unit_text.h"
#include "host/settings/variables.h"
#include "tz/ed/units.h"

namespace tzhost {

namespace {

constexpr std::wstring_view kLastPoint = L"LASTPOINT";

int setting(wchar_t const* name) {
    return static_cast<int>(Variables::instance().number(name));
}

// A part of a unit vector; one that should be zero is.
double exact(double part) {
    constexpr double kNoise = 1e-15;
    return std::fabs(part) < kNoise ? 0 : part;
}

std::optional<TzGeVector3d> readPolar(std::wstring_view text, std::size_t mark) {
    auto const distance = readDistance(text.substr(0, mark));
    auto const angle = readAngle(text.substr(mark + 1));
    if (!distance || !angle) return std::nullopt;
    return TzGeVector3d(exact(std::cos(*angle)), exact(std::sin(*angle)), 0) * *distance;
}

std::optional<TzGeVector3d> readCoordinates(std::wstring_view text) {
    std::array<double, 3> values{};
    std::size_t count = 0;
    for (bool isMore = true; isMore; ++count) {
        if (count == values.size()) return std::nullopt;
        std::size_t const comma = text.find(L',');
        auto const value = readDistance(text.substr(0, comma));
        if (!value) return std::nullopt;
        values[count] = *value;
        isMore = comma != std::wstring_view::npos;
        if (isMore) text.remove_prefix(comma + 1);
    }
    if (count < 2) return std::nullopt;
    return TzGeVector3d(values[0], values[1], values[2]);
}

}  // namespace

std::optional<double> readDistance(std::wstring_view text) {
    double value = 0;
    return readLength(text, value) ? std::optional(value) : std::nullopt;
}

std::optional<double> readAngle(std::wstring_view text) {
    double radians = 0;
    return readAngle(text, setting(L"AUNITS"), radians) ? std::optional(radians) : std::nullopt;
}

TzString shownDistance(double value) {
    TzString text;
    (void)tzdbRToS(value, setting(L"LUNITS"), setting(L"LUPREC"), text);  // finite, so it has one
    return text;
}

TzString shownAngle(double radians) {
    TzString text;
    (void)tzdbAngToS(radians, setting(L"AUNITS"), setting(L"AUPREC"), text);
    return text;
}

std::optional<TzGePoint3d> readPoint(std::wstring_view text, TzGePoint3d const& last) {
    bool const isRelative = text.starts_with(L'@');
    if (isRelative) text.remove_prefix(1);
    if (isRelative && text.empty()) return last;
    std::size_t const polar = text.find(L'<');
    auto const offset =
        polar == std::wstring_view::npos ? readCoordinates(text) : readPolar(text, polar);
    if (!offset) return std::nullopt;
    TzGePoint3d const point = (isRelative ? last : TzGePoint3d::kOrigin) + *offset;
    bool const isFinite =
        std::isfinite(point.x) && std::isfinite(point.y) && std::isfinite(point.z);
    return isFinite ? std::optional(point) : std::nullopt;
}

TzGePoint3d lastPoint() {
    VariableValue const* const value = Variables::instance().get(kLastPoint);
    auto const* const point = value ? std::get_if<VariablePoint>(value) : nullptr;
    return point ? TzGePoint3d((*point)[0], (*point)[1], (*point)[2]) : TzGePoint3d::kOrigin;
}

void setLastPoint(TzGePoint3d const& user) {
    Variables::instance().set(kLastPoint, VariablePoint{user.x, user.y, user.z}, Writer::host);
}

std::optional<TzGePoint3d> takePoint(std::wstring_view answer) {
    auto const point = readPoint(answer, lastPoint());
    if (point) setLastPoint(*point);
    return point;
}

}  // namespace tzhost
