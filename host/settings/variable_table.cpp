#include "host/settings/variable_table.h"

#include <algorithm>
#include <array>

#include "host/text/case_table.h"
#include "host/text/local_text.h"

namespace tzhost {

namespace {

constexpr auto kShort = VariableType::shortInteger;
constexpr auto kReal = VariableType::real;
constexpr auto kText = VariableType::text;
constexpr auto kPoint = VariableType::point;
constexpr auto kDrawing = KeptIn::drawing;
constexpr auto kUser = KeptIn::user;
constexpr auto kSession = KeptIn::session;
constexpr auto kOpen = Access::readWrite;
constexpr auto kFixed = Access::readOnly;

// name, type, default number, default text, limit, low, high, kept in, access. Sorted by name.
// clang-format off
constexpr std::array<VariableDefinition, 33> kVariables{{
    {L"ATTIPE", kShort, 0, L"", Limit::between, 0, 1, kUser, kOpen},
    {L"AUNITS", kShort, 0, L"", Limit::between, 0, 4, kDrawing, kOpen},
    {L"AUPREC", kShort, 0, L"", Limit::between, 0, 8, kDrawing, kOpen},
    {L"CANNOSCALEVALUE", kReal, 1, L"", Limit::above, 0, 0, kDrawing, kOpen},
    {L"CMDACTIVE", kShort, 0, L"", Limit::none, 0, 0, kSession, kFixed},
    {L"CURSORTYPE", kShort, 0, L"", Limit::between, 0, 1, kUser, kOpen},
    {L"CVPORT", kShort, 2, L"", Limit::least, 1, 0, kDrawing, kOpen},
    {L"DIALOGS", kShort, 1, L"", Limit::between, 0, 1, kUser, kOpen},
    {L"LASTPOINT", kPoint, 0, L"", Limit::none, 0, 0, kDrawing, kOpen},
    {L"LUNITS", kShort, 2, L"", Limit::between, 1, 5, kDrawing, kOpen},
    {L"LUPREC", kShort, 4, L"", Limit::between, 0, 8, kDrawing, kOpen},
    {L"MACROPLAYBACK", kShort, 0, L"", Limit::between, 0, 1, kSession, kOpen},
    {L"MTEXTCOLUMN", kShort, 0, L"", Limit::between, 0, 2, kUser, kOpen},
    {L"MTEXTCOMMANDACTIVE", kShort, 0, L"", Limit::between, 0, 1, kSession, kOpen},
    {L"MTEXTED", kText, 0, L"Internal", Limit::none, 0, 0, kUser, kOpen},
    {L"MTEXTFIXED", kShort, 0, L"", Limit::between, 0, 2, kUser, kOpen},
    {L"MTJIGSTRING", kText, 0, L"abc", Limit::none, 0, 0, kUser, kOpen},
    {L"ORTHOMODE", kShort, 0, L"", Limit::between, 0, 1, kDrawing, kOpen},
    {L"SYSCODEPAGE", kText, 0, L"ANSI_1252", Limit::none, 0, 0, kUser, kFixed},
    {L"TEXTALIGNMODE", kShort, 9, L"", Limit::none, 0, 0, kDrawing, kOpen},
    {L"TEXTALIGNSPACING", kShort, 0, L"", Limit::none, 0, 0, kDrawing, kOpen},
    {L"TEXTALIGNSPACINGVALUE", kReal, 0, L"", Limit::none, 0, 0, kDrawing, kOpen},
    {L"TEXTLAYER", kText, 0, L"", Limit::none, 0, 0, kDrawing, kOpen},
    {L"TEXTSIZE", kReal, 0.2, L"", Limit::least, 0, 0, kDrawing, kOpen},
    {L"TEXTSTYLE", kText, 0, L"Standard", Limit::none, 0, 0, kDrawing, kFixed},
    {L"TILEMODE", kShort, 1, L"", Limit::between, 0, 1, kDrawing, kOpen},
    {L"TSPACEFAC", kReal, 1, L"", Limit::between, 0.25, 4, kDrawing, kOpen},
    {L"TSPACETYPE", kShort, 1, L"", Limit::between, 1, 2, kDrawing, kOpen},
    {L"TSTACKALIGN", kShort, 1, L"", Limit::between, 0, 2, kDrawing, kOpen},
    {L"TSTACKSIZE", kShort, 70, L"", Limit::between, 25, 125, kDrawing, kOpen},
    {L"VIEWCTR", kPoint, 0, L"", Limit::none, 0, 0, kDrawing, kOpen},
    {L"VIEWDIR", kPoint, 1, L"", Limit::nonZero, 0, 0, kDrawing, kOpen},
    {L"VIEWSIZE", kReal, 10, L"", Limit::above, 0, 0, kDrawing, kOpen},
}};
// clang-format on

constexpr bool isSorted() {
    for (std::size_t i = 1; i < kVariables.size(); ++i) {
        if (!(kVariables[i - 1].name < kVariables[i].name)) return false;
    }
    return true;
}
static_assert(isSorted());

wchar_t const* nounOf(VariableType type) {
    switch (type) {
    case VariableType::shortInteger: return localText(L"a whole number");
    case VariableType::real: return localText(L"a number");
    case VariableType::text: return localText(L"a text");
    case VariableType::point: break;
    }
    return localText(L"a point x,y,z");
}

double numberOf(VariableValue const& value) {
    if (short const* const whole = std::get_if<short>(&value)) return *whole;
    if (double const* const real = std::get_if<double>(&value)) return *real;
    return 0;
}

bool isZero(VariableValue const& value) {
    VariablePoint const* const point = std::get_if<VariablePoint>(&value);
    return point != nullptr && *point == VariablePoint{};
}

bool isFinite(double number) {
    return number - number == 0;
}

bool isFinite(VariableValue const& value) {
    if (VariablePoint const* const point = std::get_if<VariablePoint>(&value)) {
        return std::all_of(point->begin(), point->end(),
                           [](double each) { return isFinite(each); });
    }
    return isFinite(numberOf(value));
}

bool isWithin(VariableDefinition const& row, VariableValue const& value) {
    double const number = numberOf(value);
    switch (row.limit) {
    case Limit::none: return true;
    case Limit::between: return number >= row.low && number <= row.high;
    case Limit::above: return number > row.low;
    case Limit::least: return number >= row.low;
    case Limit::nonZero: break;
    }
    return !isZero(value);
}

}  // namespace

VariableValue VariableDefinition::defaultValue() const {
    switch (type) {
    case VariableType::shortInteger: return static_cast<short>(number);
    case VariableType::real: return number;
    case VariableType::point: return VariablePoint{0, 0, number};
    case VariableType::text: break;
    }
    return std::wstring(text);
}

std::wstring VariableDefinition::takes() const {
    std::wstring const noun(nounOf(type));
    switch (limit) {
    case Limit::none: return noun;
    case Limit::between:
        return noun + localText(L" from ") + writeReal(low) + localText(L" to ") + writeReal(high);
    case Limit::above: return noun + localText(L" above ") + writeReal(low);
    case Limit::least: return noun + L", " + writeReal(low) + localText(L" or more");
    case Limit::nonZero: break;
    }
    return noun + localText(L" other than 0,0,0");
}

std::optional<std::wstring> VariableDefinition::complaintAbout(VariableValue const& value) const {
    if (typeOf(value) == type && isFinite(value) && isWithin(*this, value)) return std::nullopt;
    return localText(L"takes ") + takes();
}

std::span<VariableDefinition const> variableTable() {
    return kVariables;
}

// Allocates nothing: destructors that give something back look variables up, and must not fail.
VariableDefinition const* findVariable(std::wstring_view name) {
    constexpr std::size_t kLongest = 32;
    std::array<wchar_t, kLongest> buffer{};
    if (name.size() > buffer.size()) return nullptr;
    std::transform(name.begin(), name.end(), buffer.begin(), upperOf);
    std::wstring_view const capitals(buffer.data(), name.size());
    auto const at = std::lower_bound(
        kVariables.begin(), kVariables.end(), capitals,
        [](VariableDefinition const& row, std::wstring_view wanted) { return row.name < wanted; });
    return at != kVariables.end() && at->name == capitals ? &*at : nullptr;
}

}  // namespace tzhost
