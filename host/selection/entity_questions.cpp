// The questions for one entity.

#include <utility>

#include "host/command_line/point_input.h"
#include "host/command_line/question.h"
#include "host/selection/pick.h"
#include "host/text/local_text.h"
#include "tz/ed/selection.h"
#include "tz/rx/resbuf.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {

constexpr wchar_t const* kUsualPrompt = forLocalText(L"Select object: ");

// A pick with the point where it was made; a handle is picked at the last point.
struct PickedAt {
    std::optional<Picked> picked;
    TzGePoint3d point;
};

// What an answer picks; nothing when it is neither a point nor handles.
std::optional<PickedAt> readPick(std::wstring_view answer, Depth depth) {
    if (isHandles(answer)) {
        auto picked = pickByHandles(answer);
        if (!picked) return std::nullopt;
        return PickedAt{std::move(picked), lastPoint()};
    }
    auto const point = takePoint(answer);
    if (!point) return std::nullopt;
    return PickedAt{pickAt(*point, depth), *point};
}

std::wstring refusalOf(std::wstring_view answer) {
    if (!isHandles(answer))
        return localText(L"A point x,y is needed, or the handle of an entity, such as #2A.");
    return TzString::formatted(localText(L"There is no entity %ls here."),
                               std::wstring(answer).c_str())
        .str();
}

using Taker = std::function<int(PickedAt const& pick)>;

// Enter gives 5000; a pick at nothing ends the question with -5001.
int askForEntity(wchar_t const* prompt, Depth depth, Taker const& take) {
    Question question(QuestionKind::entity, prompt);
    if (prompt == nullptr) question.setPrompt(localText(kUsualPrompt));
    return question.ask([&](std::wstring_view answer) {
        auto const pick = readPick(answer, depth);
        if (!pick) return Reply::unreadable(refusalOf(answer));
        return Reply::done(pick->picked ? take(*pick) : Tzad::ePromptError);
    });
}

void putPoint(TzGePoint3d const& from, double* point) {
    if (point == nullptr) return;
    for (int i = 0; i < 3; ++i)
        point[i] = from[i];
}

void putMatrix(TzGeMatrix3d const& from, double (*matrix)[4]) {
    if (matrix == nullptr) return;
    for (int row = 0; row < 4; ++row) {
        for (int column = 0; column < 4; ++column)
            matrix[row][column] = from(row, column);
    }
}

// The references as a list, inmost first. False when a record cannot be made; then there is no
// list.
bool listReferences(std::vector<TzDbObjectId> const& references, resbuf*& list) {
    list = nullptr;
    for (TzDbObjectId const id : references) {
        resbuf* const record = tzutNewRb(Tzad::eResultEntityName);
        if (record == nullptr || tzdbGetTzsName(record->resval.rlname, id) != Tzad::eOk) {
            tzutRelRb(record);
            tzutRelRb(std::exchange(list, nullptr));
            return false;
        }
        record->rbnext = std::exchange(list, record);
    }
    return true;
}

// What a nested pick gives.
struct NestedResult {
    long long* name;
    double* point;
    double (*matrix)[4];
    resbuf** references;

    [[nodiscard]] int take(PickedAt const& pick) const {
        long long picked[2] = {};
        if (tzdbGetTzsName(picked, pick.picked->id) != Tzad::eOk) return Tzad::ePromptError;
        if (references != nullptr && !listReferences(pick.picked->references, *references)) {
            return Tzad::ePromptError;
        }
        name[0] = picked[0];
        name[1] = picked[1];
        putPoint(pick.point, point);
        putMatrix(pick.picked->placed, matrix);
        return Tzad::ePromptNormal;
    }
};

}  // namespace

}  // namespace tzhost

int tzedEntSel(wchar_t const* prompt, long long* name, double* point) {
    if (auto const failed = tzhost::failsAt("tzedEntSel")) return *failed;
    return tzhost::askForEntity(prompt, tzhost::Depth::top, [&](tzhost::PickedAt const& pick) {
        long long picked[2] = {};
        if (tzdbGetTzsName(picked, pick.picked->top) != Tzad::eOk) return Tzad::ePromptError;
        name[0] = picked[0];
        name[1] = picked[1];
        tzhost::putPoint(pick.point, point);
        return Tzad::ePromptNormal;
    });
}

int tzedNEntSelP(wchar_t const* prompt,
                 long long* name,
                 double* point,
                 int pickFlag,
                 double (*matrix)[4],
                 resbuf** references) {
    if (references != nullptr) *references = nullptr;
    if (auto const failed = tzhost::failsAt("tzedNEntSelP")) return *failed;
    tzhost::NestedResult const result{name, point, matrix, references};
    if (pickFlag == 0) {
        return tzhost::askForEntity(
            prompt, tzhost::Depth::nested,
            [&](tzhost::PickedAt const& pick) { return result.take(pick); });
    }
    (void)tzhost::commandLine().takeArmed();  // nothing is asked
    TzGePoint3d const at(point[0], point[1], point[2]);
    tzhost::PickedAt const pick{tzhost::pickAt(at, tzhost::Depth::nested), at};
    return pick.picked ? result.take(pick) : tzhost::commandLine().failed(Tzad::ePromptError);
}
