// The questions for points, numbers, angles and lengths.

#include <charconv>
#include <cmath>
#include <numbers>

#include "host/command_line/point_input.h"
#include "host/command_line/question.h"
#include "host/command_line/unit_reader.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "tz/ed/prompts.h"

using tzhost::Armed;
using tzhost::Question;
using tzhost::QuestionKind;
using tzhost::Reply;

namespace {

constexpr wchar_t const* kNoPoint = tzhost::forLocalText(
    L"A point is needed: x,y or x,y,z; @x,y or @length<angle go from the last one.");

std::optional<double> readPlainNumber(std::wstring_view text) {
    tzhost::UnitReader reader(text);
    double const sign = reader.readSign();
    double value = 0;
    if (!reader.readMixed(value) || !reader.isAtEnd()) return std::nullopt;
    return sign * value;
}

std::optional<int> readInteger(std::wstring_view text) {
    if (text.starts_with(L'+')) text.remove_prefix(1);
    std::string const digits = tzhost::toUtf8(text);
    int value = 0;
    auto const read = std::from_chars(digits.data(), digits.data() + digits.size(), value);
    bool const isWhole = read.ec == std::errc() && read.ptr == digits.data() + digits.size();
    return isWhole ? std::optional(value) : std::nullopt;
}

// What two points stand for, and how it is typed as a number.
struct Measure {
    QuestionKind kind;
    std::optional<double> (*read)(std::wstring_view text);
    double (*between)(TzGePoint3d const& from, TzGePoint3d const& to);
    TzString (*shown)(double value);
    wchar_t const* complaint;
};

double distanceBetween(TzGePoint3d const& from, TzGePoint3d const& to) {
    return from.distanceTo(to);
}

// From 0 to a full circle.
double angleBetween(TzGePoint3d const& from, TzGePoint3d const& to) {
    double const angle = std::atan2(to.y - from.y, to.x - from.x);
    return angle < 0 ? angle + 2 * std::numbers::pi : angle;
}

constexpr Measure kDistance{QuestionKind::distance, tzhost::readDistance, distanceBetween,
                            tzhost::shownDistance,
                            tzhost::forLocalText(L"A length is needed, or a point.")};
constexpr Measure kAngle{QuestionKind::angle, tzhost::readAngle, angleBetween, tzhost::shownAngle,
                         tzhost::forLocalText(L"An angle is needed, or a point.")};
constexpr Measure kOrientation{QuestionKind::orientation, tzhost::readAngle, angleBetween,
                               tzhost::shownAngle,
                               tzhost::forLocalText(L"An angle is needed, or a point.")};

Reply giveNumber(double value, Armed const& armed, double* result) {
    if (auto refusal = tzhost::refusalOf(value, armed)) return std::move(*refusal);
    *result = value;
    return Reply::done(Tzad::ePromptNormal);
}

int askMeasure(Measure const& measure, double const* base, wchar_t const* prompt, double* result) {
    Question question(measure.kind, prompt);
    std::optional<TzGePoint3d> from;
    if (base != nullptr) from.emplace(base[0], base[1], base[2]);
    return question.ask([&](std::wstring_view answer) {
        if (auto const number = measure.read(answer)) {
            return giveNumber(*number, question.armed(), result);
        }
        auto const point = tzhost::takePoint(answer);
        if (!point) return Reply::unreadable(tzhost::localText(measure.complaint));
        if (from) {
            Reply reply = giveNumber(measure.between(*from, *point), question.armed(), result);
            // What the points came to, which a person has not typed. A script is not told.
            if (reply.kind == Reply::Kind::done && tzhost::commandLine().isPerson())
                tzhost::commandLine().say(measure.shown(*result).str());
            return reply;
        }
        from = point;
        question.setPrompt(tzhost::localText(L"Second point: "));
        return Reply::goOn(Tzad::ePromptNormal);
    });
}

}  // namespace

int tzedGetPoint(double const* /*base*/, wchar_t const* prompt, double* result) {
    if (auto const failed = tzhost::failsAt("tzedGetPoint")) return *failed;
    Question question(QuestionKind::point, prompt);
    return question.ask([&](std::wstring_view answer) {
        auto const point = tzhost::takePoint(answer);
        if (!point) return Reply::unreadable(tzhost::localText(kNoPoint));
        for (int i = 0; i < 3; ++i)
            result[i] = (*point)[i];
        return Reply::done(Tzad::ePromptNormal);
    });
}

int tzedGetReal(wchar_t const* prompt, double* result) {
    if (auto const failed = tzhost::failsAt("tzedGetReal")) return *failed;
    Question question(QuestionKind::real, prompt);
    return question.ask([&](std::wstring_view answer) {
        auto const number = readPlainNumber(answer);
        if (!number) return Reply::unreadable(tzhost::localText(L"A number is needed."));
        return giveNumber(*number, question.armed(), result);
    });
}

int tzedGetInt(wchar_t const* prompt, int* result, int low, int high) {
    if (auto const failed = tzhost::failsAt("tzedGetInt")) return *failed;
    Question question(QuestionKind::integer, prompt);
    return question.ask([&](std::wstring_view answer) {
        auto const number = readInteger(answer);
        if (!number) return Reply::unreadable(tzhost::localText(L"A whole number is needed."));
        if (*number < low || *number > high) {
            return Reply::refused(
                TzString::formatted(tzhost::localText(L"A number from %d to %d is needed."), low,
                                    high)
                    .str());
        }
        if (auto refusal = tzhost::refusalOf(*number, question.armed())) return std::move(*refusal);
        *result = *number;
        return Reply::done(Tzad::ePromptNormal);
    });
}

int tzedGetAngle(double const* base, wchar_t const* prompt, double* result) {
    if (auto const failed = tzhost::failsAt("tzedGetAngle")) return *failed;
    return askMeasure(kAngle, base, prompt, result);
}

int tzedGetOrient(double const* base, wchar_t const* prompt, double* result) {
    if (auto const failed = tzhost::failsAt("tzedGetOrient")) return *failed;
    return askMeasure(kOrientation, base, prompt, result);
}

int tzedGetDist(double const* base, wchar_t const* prompt, double* result) {
    if (auto const failed = tzhost::failsAt("tzedGetDist")) return *failed;
    return askMeasure(kDistance, base, prompt, result);
}
