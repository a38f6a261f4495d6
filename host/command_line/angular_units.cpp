// Angles as text and back.

#include <algorithm>
#include <array>
#include <cmath>
#include <numbers>

#include "host/base/fault_point.h"
#include "host/command_line/unit_reader.h"
#include "host/command_line/unit_text.h"
#include "host/command_line/unit_writer.h"
#include "tz/ed/units.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

constexpr int kFinest = 8;
constexpr double kFullCircle = 2 * std::numbers::pi;
constexpr double kDegreesPerRadian = 180.0 / std::numbers::pi;
constexpr double kGradsPerRadian = 200.0 / std::numbers::pi;

// How far down a text with minutes goes, by precision: steps to a degree, and decimals of a second.
struct Steps {
    double perDegree;
    int secondDecimals;
};
constexpr std::array<Steps, kFinest + 1> kSteps{{
    {1, 0},
    {60, 0},
    {60, 0},
    {3600, 0},
    {3600, 0},
    {36e3, 1},
    {36e4, 2},
    {36e5, 3},
    {36e6, 4},
}};

using AngularWriter = void (*)(std::string& text, double radians, int precision);

// A count of steps as degrees, minutes and seconds.
void writeSteps(std::string& text, double count, Steps const& steps) {
    double const degrees = std::floor(count / steps.perDegree);
    writeFixed(text, degrees, 0);
    text += 'd';
    if (steps.perDegree < 60) return;
    double const perMinute = steps.perDegree / 60;
    double const rest = count - degrees * steps.perDegree;
    double const minutes = std::floor(rest / perMinute);
    writeFixed(text, minutes, 0);
    text += '\'';
    if (perMinute < 60) return;
    writeFixed(text, (rest - minutes * perMinute) * 60 / perMinute, steps.secondDecimals);
    text += '"';
}

double countSteps(double radians, Steps const& steps) {
    double const count = std::round(radians * kDegreesPerRadian * steps.perDegree);
    return count >= 360 * steps.perDegree ? 0 : count;
}

void writeDecimals(std::string& text, double value, double fullCircle, int precision) {
    std::string most;
    writeFixed(most, fullCircle, precision);
    writeFixed(text, value, precision);
    if (text != most) return;
    text.clear();
    writeFixed(text, 0, precision);
}

void writeDegrees(std::string& text, double radians, int precision) {
    writeDecimals(text, radians * kDegreesPerRadian, 360, precision);
}

void writeDegreesAndMinutes(std::string& text, double radians, int precision) {
    Steps const& steps = kSteps[static_cast<std::size_t>(precision)];
    writeSteps(text, countSteps(radians, steps), steps);
}

void writeGrads(std::string& text, double radians, int precision) {
    writeDecimals(text, radians * kGradsPerRadian, 400, precision);
    text += 'g';
}

void writeRadians(std::string& text, double radians, int precision) {
    writeFixed(text, radians, precision);
    text += 'r';
}

// One quarter of the circle, from `start` degrees: the angle from north or south towards east or
// west.
struct Quarter {
    double start;
    char const* due;  // the direction at its start
    char first;
    char second;
    double toward;  // degrees at which the bearing is zero
};
constexpr std::array<Quarter, 4> kQuarters{{
    {0, "E", 'N', 'E', 90},
    {90, "N", 'N', 'W', 90},
    {180, "W", 'S', 'W', 270},
    {270, "S", 'S', 'E', 270},
}};

// Straight directions are one letter.
void writeSurveyors(std::string& text, double radians, int precision) {
    Steps const& steps = kSteps[static_cast<std::size_t>(precision)];
    double const count = countSteps(radians, steps);
    auto const index = static_cast<std::size_t>(count / (90 * steps.perDegree));
    Quarter const& quarter = kQuarters[std::min(index, kQuarters.size() - 1)];
    if (count == quarter.start * steps.perDegree) {
        text += quarter.due;
        return;
    }
    text += quarter.first;
    text += ' ';
    writeSteps(text, std::fabs(count - quarter.toward * steps.perDegree), steps);
    text += ' ';
    text += quarter.second;
}

// How the unit writes, and how many radians a bare number stands for, from unit 0.
struct AngularUnit {
    AngularWriter write;
    double radians;
};
constexpr std::array<AngularUnit, 5> kUnits{{
    {writeDegrees, 1 / kDegreesPerRadian},
    {writeDegreesAndMinutes, 1 / kDegreesPerRadian},
    {writeGrads, 1 / kGradsPerRadian},
    {writeRadians, 1},
    {writeSurveyors, 1 / kDegreesPerRadian},
}};

bool isUnit(int unit) {
    return unit >= 0 && unit < static_cast<int>(kUnits.size());
}

// Adds what follows the mark of degrees: minutes and seconds, whose last mark may be left out.
void readMinutes(UnitReader& reader, double& degrees) {
    double part = 0;
    if (!reader.readNumber(part)) return;
    if (reader.skip('"')) {
        degrees += part / 3600;
        return;
    }
    degrees += part / 60;
    if (!reader.skip('\'') || !reader.readNumber(part)) return;
    degrees += part / 3600;
    reader.skip('"');
}

// An angle without sign and direction, in any of the forms with a mark, or a bare number.
bool readMagnitude(UnitReader& reader, double bare, double& radians) {
    double number = 0;
    if (!reader.readMixed(number)) return false;
    if (reader.skip('d')) {
        readMinutes(reader, number);
        radians = number / kDegreesPerRadian;
    } else if (reader.skip('\'')) {
        double seconds = 0;
        if (reader.readNumber(seconds)) reader.skip('"');
        radians = (number / 60 + seconds / 3600) / kDegreesPerRadian;
    } else if (reader.skip('"')) {
        radians = number / 3600 / kDegreesPerRadian;
    } else if (reader.skip('g')) {
        radians = number / kGradsPerRadian;
    } else if (reader.skip('r')) {
        radians = number;
    } else {
        radians = number * bare;
    }
    return true;
}

// After "N" or "S": a bearing of at most a right angle and the letter that it leans to.
bool readBearing(UnitReader& reader, char first, double& radians) {
    constexpr double kMost = std::numbers::pi / 2 + 1e-12;
    double bearing = 0;
    reader.skipBlanks();
    if (!readMagnitude(reader, 1 / kDegreesPerRadian, bearing) || bearing > kMost) return false;
    reader.skipBlanks();
    char const second = reader.peek();
    for (Quarter const& quarter : kQuarters) {
        if (quarter.first != first || quarter.second != second) continue;
        reader.skip(second);
        double const toward = quarter.toward / kDegreesPerRadian;
        radians = quarter.start < quarter.toward ? toward - bearing : toward + bearing;
        return true;
    }
    return false;
}

bool readSigned(UnitReader& reader, double bare, double& radians) {
    double const sign = reader.readSign();
    if (!readMagnitude(reader, bare, radians)) return false;
    radians *= sign;
    return true;
}

}  // namespace

bool readAngle(std::wstring_view text, int unit, double& radians) {
    double const bare = kUnits[isUnit(unit) ? static_cast<std::size_t>(unit) : 0].radians;
    UnitReader reader(text);
    double read = 0;
    char const first = reader.peek();
    auto const quarter = std::find_if(kQuarters.begin(), kQuarters.end(),
                                      [first](Quarter const& row) { return *row.due == first; });
    if (quarter == kQuarters.end()) {
        if (!readSigned(reader, bare, read)) return false;
    } else {
        reader.skip(first);
        read = quarter->start / kDegreesPerRadian;
        if (!reader.isAtEnd() && !readBearing(reader, first, read)) return false;
    }
    if (!reader.isAtEnd() || !std::isfinite(read)) return false;
    radians = read;
    return true;
}

}  // namespace tzhost

int tzdbAngToS(double radians, int unit, int precision, TzString& text) {
    if (auto const fault = tzhost::faultAt("tzdbAngToS")) return *fault;
    if (!tzhost::isUnit(unit) || !std::isfinite(radians)) return Tzad::ePromptError;
    double inCircle = std::fmod(radians, tzhost::kFullCircle);
    if (inCircle < 0) inCircle += tzhost::kFullCircle;
    std::string written;
    tzhost::kUnits[static_cast<std::size_t>(unit)].write(written, inCircle,
                                                         std::clamp(precision, 0, tzhost::kFinest));
    text = TzString(std::wstring(written.begin(), written.end()));
    return Tzad::ePromptNormal;
}

int tzdbAngToF(wchar_t const* text, int unit, double* radians) {
    if (auto const fault = tzhost::faultAt("tzdbAngToF")) return *fault;
    if (text == nullptr || radians == nullptr || !tzhost::isUnit(unit)) return Tzad::ePromptError;
    return tzhost::readAngle(text, unit, *radians) ? Tzad::ePromptNormal : Tzad::ePromptError;
}
