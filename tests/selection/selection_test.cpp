// Selections: what each answer and mode selects, and what filters see of it.

#include <gtest/gtest.h>

#include "host/base/fault_point.h"
#include "host/selection/entity_list.h"
#include "host/selection/selection_sets.h"
#include "tests/selection/drawing_session.h"
#include "tz/ed/prompts.h"
#include "tz/ed/selection_filter.h"
#include "tz/rx/resbuf.h"

namespace {

using tzhost::test::handlesOf;
using tzhost::test::OpenDrawing;
using tzhost::test::ScriptedSession;

// The drawing: line "1" from 0,0 to 2,0; line "2" from 5,5 to 7,7; text "3" about 20,20 turned by
// 45 degrees; line "4" from 0,0 to 1,1 on a locked layer; line "5" in paper space.
class Selections : public testing::Test {
protected:
    Selections() {
        names_ = {drawing_.addLine({0, 0, 0}, {2, 0, 0}), drawing_.addLine({5, 5, 0}, {7, 7, 0}),
                  drawing_.addText({20, 20, 0}, L"WWWWWWWW", 45), addLocked(),
                  drawing_.addLine({0, 0, 0}, {9, 9, 0}, kPaperSpaceName)};
    }
    ~Selections() override {
        tzhost::freeAllSets();
        tzhost::dropImpliedSelection();
        EXPECT_TRUE(tzhost::audit().clean());
    }

    std::string addLocked() {
        drawing_.addLayer(L"Frozen", true);
        auto* const line = new TzDbLine;
        line->setDatabaseDefaults();
        EXPECT_EQ(line->setEndPoint({1, 1, 0}), Tzad::eOk);
        TzDbLayerTable* table = nullptr;
        TzDbObjectId layer;
        EXPECT_EQ(drawing_.drawing().getLayerTable(table, TzDb::kForRead), Tzad::eOk);
        EXPECT_EQ(table->getIdAt(L"frozen", layer), Tzad::eOk);
        EXPECT_EQ(table->close(), Tzad::eOk);
        EXPECT_EQ(line->setLayer(layer), Tzad::eOk);
        return drawing_.add(line);
    }

    // In a script "$1" stands for the handle of entity 1.
    std::string expanded(std::string_view text) const {
        std::string result;
        for (std::size_t i = 0; i < text.size(); ++i) {
            if (text[i] != '$') {
                result += text[i];
            } else {
                result += "#" + names_[static_cast<std::size_t>(text[++i] - '1')];
            }
        }
        return result;
    }
    // The numbers of the selected entities, "1 3".
    std::string numbersOf(long long const* set) const {
        std::string text = " " + handlesOf(set) + " ";
        for (std::size_t i = 0; i < names_.size(); ++i) {
            std::string const name = " " + names_[i] + " ";
            std::size_t const at = text.find(name);
            if (at != text.npos) text.replace(at, name.size(), " @" + std::to_string(i + 1) + " ");
        }
        std::string result;
        for (char const c : text) {
            if (c != '@') result += c;
        }
        return result.substr(1, result.size() - 2);
    }
    // Status and numbers of one selection.
    std::string select(std::string_view script,
                       wchar_t const* mode = nullptr,
                       void const* first = nullptr,
                       resbuf const* filter = nullptr) {
        ScriptedSession const session(expanded(script));
        long long set[2] = {7, 7};
        int const status = tzedSSGet(mode, first, nullptr, filter, set);
        transcript_ = TzString(session.transcript()).toUtf8();
        std::string const result = std::to_string(status) + " " + numbersOf(set);
        int const freed = tzedSSFree(set);
        EXPECT_EQ(freed == Tzad::ePromptNormal, status == Tzad::ePromptNormal);
        EXPECT_EQ(tzedSSFree(set), freed);  // a freed set may be freed again
        return result;
    }

    OpenDrawing drawing_;
    std::vector<std::string> names_;
    std::string transcript_;
};

struct SelectionRow {
    char const* name;
    std::string_view script;
    std::string_view result;
};

constexpr SelectionRow kSelections[] = {
    {"Handles", "$1 $3\n$2\n\n", "5100 1 3 2"},
    {"TwiceIsOnce", "$1 $1\n$1\n\n", "5100 1"},
    {"All", "all\n\n", "5100 1 2 3 4"},
    {"Last", "LAST\n\n", "5100 4"},
    {"Point", "6.5,5.5\n\n", "5100 2"},
    {"PointTakesNewest", "0.5,0\n\n", "5100 4"},
    {"PointAtNothing", "-5,-5\n6,6\n\n", "5100 2"},
    {"Window", "w -1,-1 3,3\n\n", "5100 1 4"},
    {"WindowAnyCorner", "_W 8,8 4,4\n\n", "5100 2"},
    {"WindowHoldsNotAll", "w -1,-1 6,6\n\n", "5100 1 4"},
    {"Crossing", "c 1,-1 6,6\n\n", "5100 1 2 4"},
    {"CrossingByCorners", "_C\n1,-1\n~3,3\n6,6\n\n", "5100 1 2 4"},
    {"WindowGivenUp", "w\n\nw\n9,9\n\n$1\n\n", "5100 1"},
    {"WindowCancelled", "$1\nwindow\n0,0\n^C", "-5002 none"},
    {"CrossingBesideLine", "c 5,6 6,7\n$1\n\n", "5100 2 1"},
    {"CrossingMissesLine", "c 5.1,6 5.2,7\n$1\n\n", "5100 1"},
    // In the box around the turned text, but not in the text.
    {"CrossingByOutline", "c 20.1,22 20.3,22.5\n$1\n\n", "5100 1"},
    {"CrossingInsideText", "c 21,20.6 21.1,20.7\n\n", "5100 3"},
    // A refused answer leaves the last point, 0,0; the second corner is read from the first.
    {"WindowFromLast", "w 7,7 zz\nw @-1,-1 @4,4\n\n", "5100 1 4"},
    {"Fence", "f 1.5,-1 1.5,1 8,4 5.5,6.5\n\n", "5100 1 2"},
    {"FenceAtAnEnd", "_F 1,3 1,1 3,3\n\n", "5100 4"},
    {"FenceByOutline", "f 20.1,22 20.3,22.5\n$1\n\n", "5100 1"},
    {"FenceInsideText", "fence 21,20.6 @0.1,0.1\n\n", "5100 3"},
    {"FencePointByPoint", "f\n1.5,-1\n~3,3\n9,9\nU\n@0,2\n\n\n", "5100 1"},
    {"FenceTakenBack", "f\n9,9\nU\n1,1\n\n$2\n\n", "5100 2"},
    {"FenceCancelled", "$1\nf\n0,0\n^C", "-5002 none"},
    {"Remove", "all\nremove\n$1 $4\nadd\n$1\n\n", "5100 2 3 1"},
    {"RemoveByCrossing", "all\nR\nc 1,-1 6,6\n\n", "5100 3"},
    {"Nothing", "\n", "-5001 none"},
    {"AllRemoved", "$1\nr\n$1\n\n", "-5001 none"},
    {"Cancel", "$1\n^C", "-5002 none"},
    {"InputEnds", "$1\n", "-5002 none"},
    {"OtherSpace", "$5\n$1\n\n", "5100 1"},
    {"Refused", "#ZZ\nwindow 1,1\nall 1\nf 1,1\nf 1,1 z\n#\n#1/\n1,1,1,1\n$1\n\n", "5100 1"},
};

class SelectionTable : public Selections, public testing::WithParamInterface<SelectionRow> {};
TEST_P(SelectionTable, Selects) {
    EXPECT_EQ(select(GetParam().script), GetParam().result) << transcript_;
}
INSTANTIATE_TEST_SUITE_P(Answers,
                         SelectionTable,
                         testing::ValuesIn(kSelections),
                         [](auto const& row) { return row.param.name; });

TEST_F(Selections, PassOverWhatIsInvisible) {
    TzDbEntity* text = nullptr;
    ASSERT_EQ(tzdbOpenObject(text, drawing_.id(names_[2]), TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(text->setVisibility(TzDb::kInvisible), Tzad::eOk);
    EXPECT_EQ(text->close(), Tzad::eOk);
    EXPECT_EQ(select("21,20.65\nc 21,20.6 21.1,20.7\nw 0,0 90,90\n\n"), "5100 1 2 4");
    EXPECT_EQ(select("$3\n\n"), "5100 3");
}

TEST_F(Selections, FollowTheirMode) {
    EXPECT_EQ(select("all\n\n", L"_:L"), "5100 1 2 3");
    EXPECT_EQ(select("all\n\n", L"_:l:c:p"), "5100 1 2 3");
    EXPECT_EQ(select("all\n\n", L"_:c:p"), "5100 1 2 3 4");
    EXPECT_EQ(select("", L"X"), "5100 1 2 3 4 5");
    EXPECT_EQ(select("", L"_P"), "5100 1 2 3 4 5");
    EXPECT_EQ(select("", L"_I"), "-5001 none");
    EXPECT_EQ(select("", L"_Q"), "-5001 none");
    double const pick[3] = {6, 6, 0};
    EXPECT_EQ(select("", L"", pick), "5100 2");
}

TEST_F(Selections, ShowBothPrompts) {
    wchar_t const* const pair[2] = {L"Take: ", L""};
    EXPECT_EQ(select("$1 $2\nr\n$2\n\n", L"_:$", pair), "5100 1");
    EXPECT_EQ(transcript_, expanded("Take: $1 $2\n2 found\nTake: r\nRemove objects: $2\n1 removed\n"
                                    "Remove objects: "));
}

TEST_F(Selections, RememberThePreviousOne) {
    EXPECT_EQ(select("$1 $2\n\n"), "5100 1 2");
    EXPECT_EQ(select("$3\n^C"), "-5002 none");
    TzDbEntity* line = nullptr;
    ASSERT_EQ(tzdbOpenObject(line, drawing_.id(names_[1]), TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(line->erase(), Tzad::eOk);
    EXPECT_EQ(line->close(), Tzad::eOk);
    EXPECT_EQ(select("previous\n\n"), "5100 1");
}

TEST_F(Selections, TakeOverTheImpliedOne) {
    ScriptedSession const session(expanded("$1 $2\n\n"));
    long long set[2] = {};
    ASSERT_EQ(tzedSSGet(nullptr, nullptr, nullptr, nullptr, set), Tzad::ePromptNormal);
    EXPECT_EQ(tzedSSSetFirst(nullptr, set), Tzad::ePromptNormal);
    EXPECT_EQ(select("", L"_I"), "5100 1 2");
    tzedSSSetFirst(nullptr, nullptr);
    EXPECT_EQ(select("", L"_I"), "-5001 none");
}

class FilterList {
public:
    FilterList(std::initializer_list<std::pair<int, wchar_t const*>> conditions) {
        resbuf** end = &first_;
        for (auto const& [code, text] : conditions) {
            *end = tzutNewRb(code);
            (*end)->resval.rstring = tzutNewString(text);
            end = &(*end)->rbnext;
        }
    }
    FilterList(FilterList const&) = delete;
    FilterList& operator=(FilterList const&) = delete;
    ~FilterList() { tzutRelRb(first_); }
    [[nodiscard]] resbuf const* get() const { return first_; }

private:
    resbuf* first_ = nullptr;
};

TEST_F(Selections, KeepToAFilterList) {
    auto const with = [this](FilterList const& list) {
        return select("all\n\n", nullptr, nullptr, list.get());
    };
    EXPECT_EQ(with({{0, L"MTEXT"}}), "5100 3");
    EXPECT_EQ(with({{5020, L"line"}}), "5100 1 2 4");
    EXPECT_EQ(with({{0, L"LINE"}, {8, L"fro*"}}), "5100 4");
    EXPECT_EQ(with({{8, L"0"}, {0, L"~M*"}}), "5100 1 2");
    EXPECT_EQ(with({{7, L"standard"}}), "5100 3");
    EXPECT_EQ(with({{0, L"CIRCLE"}}), "-5001 none");
    EXPECT_EQ(with({{1, L"x"}}), "-5001 none");
}

// Takes out what it is told to, and notes what it is shown.
class NotingFilter : public TzEdSSGetFilter {
public:
    void ssgetAddFilter(int flags,
                        TzEdSelectionSetService& service,
                        TzArray<TzDbObjectId> const& set,
                        TzArray<TzDbObjectId> const& fresh) override {
        notes += "add" + std::to_string(flags) + ":" + std::to_string(set.length()) + "+" +
                 std::to_string(fresh.length()) + " ";
        for (int const index : takes) {
            notes += service.remove(index) == Tzad::eOk ? "taken " : "refused ";
        }
    }
    void ssgetRemoveFilter(int,
                           TzEdSelectionSetService& service,
                           TzArray<TzDbObjectId> const& set,
                           TzArray<TzDbObjectId> const& going) override {
        notes +=
            "remove:" + std::to_string(set.length()) + "-" + std::to_string(going.length()) + " ";
        if (keepsFirst) (void)service.remove(0);
    }
    void endSSGet(int status,
                  int,
                  TzEdSelectionSetService& service,
                  TzArray<TzDbObjectId> const& set) override {
        notes += "end" + std::to_string(status) + ":" + std::to_string(set.length());
        if (service.remove(atEnd) != Tzad::eOk) notes += " refused";
    }

    std::string notes;
    std::vector<int> takes;
    TzArray<int> atEnd;
    bool keepsFirst = false;
};

class Filtered : public Selections {
protected:
    Filtered() {
        EXPECT_TRUE(addSSgetFilterInputContextReactor(tzhost::documents().current(), &filter_, 15));
        EXPECT_EQ(tzhost::audit().filters, 1);
    }
    ~Filtered() override {
        auto* const document = tzhost::documents().current();
        EXPECT_TRUE(removeSSgetFilterInputContextReactor(document, &filter_));
        EXPECT_FALSE(removeSSgetFilterInputContextReactor(document, &filter_));
    }

    NotingFilter filter_;
};

TEST_F(Filtered, SelectionsKeepTheNumberingWhileOneTakesOut) {
    filter_.takes = {0, 2, 2, 4, -1};
    EXPECT_EQ(select("all\n\n"), "5100 2 4");
    EXPECT_EQ(filter_.notes, "add15:0+4 taken taken taken refused refused end5100:2");
}

TEST_F(Filtered, SelectionsAskAboutEachAdditionAndRemoval) {
    filter_.keepsFirst = true;
    EXPECT_EQ(select("$1\n$1 $2 $3\nr\n$1 $3\n\n"), "5100 1 2");
    EXPECT_EQ(filter_.notes, "add15:0+1 add15:1+2 remove:3-2 end5100:2");
}

TEST_F(Filtered, SelectionsEndWithItsLastWord) {
    filter_.atEnd = {0, 1};
    EXPECT_EQ(select("$1 $2 $3\n\n"), "5100 3");
    filter_.atEnd = {0, 9};
    filter_.notes.clear();
    EXPECT_EQ(select("$1\n\n"), "-5001 none");
    EXPECT_EQ(filter_.notes, "add15:0+1 end5100:1 refused");
    filter_.notes.clear();
    EXPECT_EQ(select("$1\n^C"), "-5002 none");
    EXPECT_EQ(filter_.notes, "add15:0+1 end-5002:0 refused");
}

TEST_F(Filtered, TheImpliedSelectionIsToo) {
    tzhost::EntityIds ids;
    ids.append(drawing_.id(names_[0]));
    ids.append(drawing_.id(names_[1]));
    tzhost::setImpliedSelection(ids);
    filter_.takes = {1};
    EXPECT_EQ(select("", L"_I"), "5100 1");
    EXPECT_EQ(filter_.notes, "add15:0+2 taken end5100:1");
}

TEST_F(Selections, RefuseFiltersWithoutADocument) {
    NotingFilter filter;
    EXPECT_FALSE(addSSgetFilterInputContextReactor(nullptr, &filter, 15));
    EXPECT_FALSE(addSSgetFilterInputContextReactor(tzhost::documents().current(), nullptr, 15));
}

// Asks a question of its own, as a module's options do.
std::string calls;
resbuf* noteKeyword(wchar_t const* keyword) {
    TzString word;
    (void)tzedInitGet(4, L"Left Right");
    int const status = tzedGetKword(L"Which? ", word);
    calls += TzString(keyword).toUtf8() + ":" + std::to_string(status) + word.toUtf8() + " ";
    return nullptr;
}

class KeywordCallback {
public:
    KeywordCallback() {
        EXPECT_EQ(tzedSSGetKwordCallbackPtr(&before_), Tzad::ePromptNormal);
        tzedSSSetKwordCallbackPtr(noteKeyword);
        EXPECT_TRUE(tzhost::audit().keywordCallback);
        calls.clear();
    }
    KeywordCallback(KeywordCallback const&) = delete;
    KeywordCallback& operator=(KeywordCallback const&) = delete;
    ~KeywordCallback() { tzedSSSetKwordCallbackPtr(before_); }

private:
    TzedSSKeywordCallback before_ = nullptr;
};

TEST_F(Selections, HandKeywordsToTheCallbackAndGoOn) {
    KeywordCallback const callback;
    ScriptedSession const session(expanded("I\nright\n$1\noptionen\n\na\n_options\n^C\nall\n\n"));
    ASSERT_EQ(tzedInitGet(1, L"Ausrichten Optionen _alIgnment Options"), Tzad::ePromptNormal);
    long long set[2] = {};
    wchar_t const* const pair[2] = {L"Select: ", L""};
    EXPECT_EQ(tzedSSGet(L"_:L:K:$", pair, L"Ausrichten Optionen _alIgnment Options", nullptr, set),
              Tzad::ePromptNormal);
    EXPECT_EQ(calls, "alIgnment:5100Right Options:5000 alIgnment:-5002 ");
    EXPECT_EQ(numbersOf(set), "1 2 3");
}

TEST_F(Selections, GiveKeywordsBackWithoutTheCallback) {
    ScriptedSession const session(expanded("$1\nopt\n"));
    ASSERT_EQ(tzedInitGet(1, L"Options"), Tzad::ePromptNormal);
    long long set[2] = {};
    EXPECT_EQ(tzedSSGet(nullptr, nullptr, nullptr, nullptr, set), Tzad::ePromptKeyword);
    TzString input;
    EXPECT_EQ(tzedGetInput(input), Tzad::ePromptNormal);
    EXPECT_EQ(input, L"Options");
}

TEST_F(Selections, SetsKnowTheirEnds) {
    ScriptedSession const session(expanded("$1\n\n"));
    long long set[2] = {};
    ASSERT_EQ(tzedSSGet(nullptr, nullptr, nullptr, nullptr, set), Tzad::ePromptNormal);
    EXPECT_EQ(tzhost::audit().selectionSets, 1);
    long long name[2] = {};
    EXPECT_EQ(tzedSSName(set, 1, name), Tzad::ePromptError);
    EXPECT_EQ(tzedSSName(set, -1, name), Tzad::ePromptError);
    long long const other[2] = {set[0] + 1, set[1]};
    int length = 0;
    EXPECT_EQ(tzedSSLength(other, &length), Tzad::ePromptError);
    auto const before = tzhost::setFaultHook(
        [](std::string_view operation, int&) { return operation == "tzedSSFree"; });
    EXPECT_EQ(tzedSSFree(set), Tzad::ePromptError);
    tzhost::setFaultHook(before);
    EXPECT_EQ(tzhost::audit().selectionSets, 0);
}

}  // namespace
