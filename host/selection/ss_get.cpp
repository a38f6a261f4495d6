// The selection as a question, and the callback for its keywords.

#include <utility>

#include "host/base/audit.h"
#include "host/base/fault_point.h"
#include "host/base/memory_faults.h"
#include "host/command_line/question.h"
#include "host/selection/pick.h"
#include "host/selection/selecting.h"
#include "host/selection/selection_report.h"
#include "host/selection/selection_sets.h"
#include "host/selection/selection_words.h"
#include "host/text/local_text.h"
#include "tz/ed/selection.h"

namespace tzhost {

namespace {

constexpr wchar_t const* kAddPrompt = forLocalText(L"Select objects: ");
constexpr wchar_t const* kRemovePrompt = forLocalText(L"Remove objects: ");

TzedSSKeywordCallback& keywordCallback() {
    static TzedSSKeywordCallback callback = nullptr;
    return callback;
}

// The prompts of a selection; an empty one reads as the host's own.
struct Prompts {
    wchar_t const* add = nullptr;
    wchar_t const* remove = nullptr;

    static Prompts of(SelectionMode const& mode, void const* argument) {
        if (!mode.hasPrompts || argument == nullptr) return {};
        auto const* const pair = static_cast<wchar_t const* const*>(argument);
        return {pair[0], pair[1]};
    }
    static wchar_t const* shown(wchar_t const* own, wchar_t const* usual) {
        return own != nullptr && *own != 0 ? own : localText(usual);
    }
};

// What tzedInitGet armed; without words there the list that the selection was given.
Armed armedFor(SelectionMode const& mode, void const* list) {
    Armed armed = commandLine().takeArmed();
    if (!mode.hasPrompts || list == nullptr || !armed.words.isEmpty()) return armed;
    armed.list = static_cast<wchar_t const*>(list);
    armed.words = KeywordList::parse(armed.list).value_or(KeywordList());
    return armed;
}

// The question that goes on, line by line, until Enter.
class SelectionQuestion {
public:
    SelectionQuestion(SelectionMode const& mode, Prompts prompts, Armed armed, Selecting& selecting)
        : prompts_(prompts), selecting_(selecting),
          question_(QuestionKind::selection, prompts.add, std::move(armed)) {
        question_.clearFlags();
        question_.setEndings(Tzad::ePromptNormal, Tzad::ePromptCancel);
        question_.setPrompt(Prompts::shown(prompts_.add, kAddPrompt));
        if (mode.wordsGoToCallback) {
            question_.setWordReader([this](int index) { return callBack(index); });
        }
    }

    [[nodiscard]] int ask() {
        return question_.ask([this](std::wstring_view answer) { return take(answer); });
    }

private:
    // The callback may ask questions of its own; a list that it returns is ignored.
    Reply callBack(int index) {
        if (keywordCallback() != nullptr) {
            (void)keywordCallback()(question_.armed().words.global(index).c_str());
        }
        return Reply::goOn(Tzad::ePromptKeyword);
    }

    Reply take(std::wstring_view text) {
        auto const answer = readSelection(text);
        if (!answer) return Reply::refused(refusedSelection(text));
        switch (answer->kind) {
        case SelectionAnswer::Kind::entities:
            commandLine().say(isRemoving_ ? reportOf(selecting_.remove(answer->ids))
                                          : reportOf(selecting_.add(answer->ids)));
            break;
        case SelectionAnswer::Kind::add:
            isRemoving_ = false;
            question_.setPrompt(Prompts::shown(prompts_.add, kAddPrompt));
            break;
        case SelectionAnswer::Kind::remove:
            isRemoving_ = true;
            question_.setPrompt(Prompts::shown(prompts_.remove, kRemovePrompt));
            break;
        case SelectionAnswer::Kind::cancelled: return Reply::done(Tzad::ePromptCancel);
        }
        return Reply::goOn(Tzad::ePromptNormal);
    }

    Prompts prompts_;
    Selecting& selecting_;
    Question question_;
    bool isRemoving_ = false;
};

TzGePoint2d asFlat(void const* point) {
    auto const* const values = static_cast<double const*>(point);
    return {values[0], values[1]};
}

EntityIds entitiesBetween(void const* first, void const* second, Touch touch) {
    if (first == nullptr || second == nullptr) return EntityIds();
    return entitiesIn(FlatBox::between(asFlat(first), asFlat(second)), touch);
}

// What a way that asks nothing selects.
EntityIds entitiesFor(SelectionWay way, void const* first, void const* second) {
    switch (way) {
    case SelectionWay::implied: return impliedSelection();
    case SelectionWay::all: return entitiesOfAllSpaces();
    case SelectionWay::previous: return previousSelection();
    case SelectionWay::window: return entitiesBetween(first, second, Touch::within);
    case SelectionWay::crossing: return entitiesBetween(first, second, Touch::crossing);
    case SelectionWay::last: return newestEntity();
    case SelectionWay::ask: break;
    }
    EntityIds ids;
    TzGePoint2d const at = asFlat(first);
    if (auto const picked = pickAt({at.x, at.y, 0}, Depth::top)) ids.append(picked->id);
    return ids;
}

int select(SelectionMode const& mode, void const* first, void const* second, Selecting& selecting) {
    bool const asks = mode.way == SelectionWay::ask && (mode.hasPrompts || first == nullptr);
    if (asks) {
        Prompts const prompts = Prompts::of(mode, first);
        return SelectionQuestion(mode, prompts, armedFor(mode, second), selecting).ask();
    }
    selecting.add(entitiesFor(mode.way, first, second));
    return Tzad::ePromptNormal;
}

}  // namespace

}  // namespace tzhost

int tzedSSGet(wchar_t const* mode,
              void const* first,
              void const* second,
              resbuf const* filter,
              long long* set) {
    if (set != nullptr) tzhost::nameNoSet(set);
    if (auto const failed = tzhost::failsAt("tzedSSGet")) return *failed;
    auto const how = tzhost::SelectionMode::parse(mode);
    auto const conditions = tzhost::ListFilter::read(filter);
    if (!how || !conditions || set == nullptr)
        return tzhost::commandLine().failed(Tzad::ePromptError);
    tzhost::Selecting selecting(*how, *conditions);
    int const status = selecting.finish(tzhost::select(*how, first, second, selecting));
    if (status != Tzad::ePromptNormal) return status;
    tzhost::setPreviousSelection(selecting.entities());
    tzhost::nameNewSet(selecting.entities(), set);
    return status;
}

int tzedSSGetKwordCallbackPtr(TzedSSKeywordCallback* callback) {
    if (auto const fault = tzhost::faultAt("tzedSSGetKwordCallbackPtr")) return *fault;
    if (callback == nullptr) return Tzad::ePromptError;
    *callback = tzhost::keywordCallback();
    return Tzad::ePromptNormal;
}

// Taking a callback back happens even when the plan makes it report a failure.
int tzedSSSetKwordCallbackPtr(TzedSSKeywordCallback callback) {
    tzhost::MemoryFaultPause const givesBack;
    auto const fault = tzhost::faultAt("tzedSSSetKwordCallbackPtr");
    if (fault && callback != nullptr) return *fault;
    tzhost::keywordCallback() = callback;
    tzhost::audit().keywordCallback = callback != nullptr;
    return fault ? *fault : Tzad::ePromptNormal;
}
