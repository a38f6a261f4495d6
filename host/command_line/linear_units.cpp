// Lengths as text and back. One drawing unit is one inch wherever feet are written.

#include <algorithm>
#include <cmath>

#include "host/base/fault_point.h"
#include "host/command_line/unit_reader.h"
#include "host/command_line/unit_text.h"
#include "host/command_line/unit_writer.h"
#include "tz/ed/units.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

constexpr int kFinest = 8;
constexpr double kInchesPerFoot = 12.0;

// `value` is not negative in any of these.
using LinearWriter = void (*)(std::string& text, double value, int precision);

// Adds feet, when there are any, before `inches` whose digits up to the point or blank are
// whole.
void writeFeet(std::string& text, std::string inches, std::size_t wholeDigits) {
    std::string feet = inches.substr(0, wholeDigits);
    int const rest = divideByTwelve(feet);
    if (feet == "0") {
        text += inches + '"';
        return;
    }
    text += feet + "'-" + std::to_string(rest) + inches.substr(wholeDigits) + '"';
}

void writeScientificLength(std::string& text, double value, int precision) {
    writeScientific(text, value, precision);
}

void writeDecimalLength(std::string& text, double value, int precision) {
    writeFixed(text, value, precision);
}

void writeFeetAndDecimals(std::string& text, double value, int precision) {
    std::string inches;
    writeFixed(inches, value, precision);
    writeFeet(text, inches, std::min(inches.find('.'), inches.size()));
}

void writeFeetAndFractions(std::string& text, double value, int precision) {
    double const denominator = std::ldexp(1.0, precision);
    double const pieces = std::round(value * denominator);
    std::string inches;
    writeMixed(inches, pieces, denominator);
    if (pieces < denominator) {
        text += inches + '"';
    } else {
        writeFeet(text, inches, std::min(inches.find(' '), inches.size()));
    }
}

void writeFractions(std::string& text, double value, int precision) {
    double const denominator = std::ldexp(1.0, precision);
    writeMixed(text, std::round(value * denominator), denominator);
}

// In the order of the unit numbers, from 1.
constexpr LinearWriter kWriters[] = {writeScientificLength, writeDecimalLength,
                                     writeFeetAndDecimals, writeFeetAndFractions, writeFractions};
constexpr int kUnits = static_cast<int>(std::size(kWriters));

bool isZero(std::string_view text) {
    return text.substr(0, text.find('E')).find_first_of("123456789") == std::string_view::npos;
}

}  // namespace

bool readLength(std::wstring_view text, double& value) {
    UnitReader reader(text);
    double const sign = reader.readSign();
    double total = 0;
    if (!reader.readMixed(total)) return false;
    if (reader.skip('\'')) {
        total *= kInchesPerFoot;
        reader.skipBlanks();
        reader.skip('-');
        reader.skipBlanks();
        double inches = 0;
        if (reader.readMixed(inches)) {
            total += inches;
            reader.skip('"');
        }
    } else {
        reader.skip('"');
    }
    if (!reader.isAtEnd() || !std::isfinite(total)) return false;
    value = sign * total;
    return true;
}

}  // namespace tzhost

int tzdbRToS(double value, int unit, int precision, TzString& text) {
    if (auto const fault = tzhost::faultAt("tzdbRToS")) return *fault;
    if (unit < 1 || unit > tzhost::kUnits || !std::isfinite(value)) return Tzad::ePromptError;
    precision = std::clamp(precision, 0, tzhost::kFinest);
    // Beyond this every number is whole, and finer pieces of it would overflow.
    if (std::fabs(value) > 0x1p60 && unit > 3) precision = 0;
    std::string written;
    tzhost::kWriters[unit - 1](written, std::fabs(value), precision);
    std::wstring result;
    result.reserve(written.size() + 1);
    if (value < 0 && !tzhost::isZero(written)) result += L'-';
    result.append(written.begin(), written.end());
    text = TzString(std::move(result));
    return Tzad::ePromptNormal;
}

int tzdbDisToF(wchar_t const* text, int unit, double* value) {
    if (auto const fault = tzhost::faultAt("tzdbDisToF")) return *fault;
    if (text == nullptr || value == nullptr || unit < 1 || unit > tzhost::kUnits) {
        return Tzad::ePromptError;
    }
    return tzhost::readLength(text, *value) ? Tzad::ePromptNormal : Tzad::ePromptError;
}
