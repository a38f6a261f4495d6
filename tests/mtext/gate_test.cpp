// The gate to the editors: which texts pass, what is said when they do not, and how a text is left.

#include <gtest/gtest.h>

#include <new>
#include <utility>

#include "host/base/fault_point.h"
#include "host/base/memory_faults.h"
#include "module/host_calls/space_posting.h"
#include "tests/mtext/held_text.h"
#include "tz/db/field.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"
#include "tz/ed/variables.h"
#include "tz/mte/dialog_params.h"
#include "tz/mte/dialog_session.h"
#include "tz/mte/edit_mtext.h"
#include "tz/mte/globals.h"

namespace {

constexpr char const* kBlock = "<<<\nafter\n>>>\n";

TzDbObjectId post(TzDbEntity* entity) {
    entity->setDatabaseDefaults();
    TzDbObjectId id;
    EXPECT_EQ(postToDb(entity, id, false), Tzad::eOk);
    return id;
}

TzDbObjectId postText() {
    auto* const text = new TzDbMText;
    EXPECT_EQ(text->setContents(L"before"), Tzad::eOk);
    return post(text);
}

TzString contentsOf(TzDbObjectId id) {
    EasyObject<TzDbMText> text;
    EXPECT_EQ(tzdbOpenObject(text.object, id, TzDb::kForRead), Tzad::eOk);
    return text.object ? text->contents() : TzString();
}

void lockLayerZero() {
    EasyObject<TzDbLayerTableRecord> layer;
    ASSERT_EQ(tzdbOpenObject(layer.object, tzhost::workingDrawing()->clayer(), TzDb::kForWrite),
              Tzad::eOk);
    EXPECT_EQ(layer->setIsLocked(true), Tzad::eOk);
}

void activateWorkingSet(TzDbObjectId left) {
    tzhost::DrawingSettings settings = tzhost::workingDrawing()->settings();
    settings.workingSetExists = true;
    settings.workingSetActive = true;
    tzhost::workingDrawing()->setSettings(settings);
    left.record()->inWorkingSet = false;
}

int editById(TzDbObjectId id) {
    return InvokeEditorOn(id, kMTETabText, 0, true, true);
}

// The holder of the second overload closes the text.
int editByPointer(TzDbObjectId id) {
    TzDbMText* text = nullptr;
    EXPECT_EQ(tzdbOpenObject(text, id, TzDb::kForRead), Tzad::eOk);
    int const result = InvokeEditorOn(text, kMTETabText, 0, true, true, false, false);
    Tzad::ErrorStatus const status = tzdbOpenObject(text, id, TzDb::kForWrite);
    EXPECT_TRUE(status == Tzad::eOk || status == Tzad::eOnLockedLayer) << status;
    if (text) {
        EXPECT_EQ(text->close(), Tzad::eOk);
    }
    return result;
}

struct GateRow {
    char const* name;
    int (*edit)(TzDbObjectId);
    void (*prepare)(TzDbObjectId);
    int result;
    wchar_t const* shown;  // of the transcript
    wchar_t const* contents;
};

void nothing(TzDbObjectId) {}
void lock(TzDbObjectId) {
    lockLayerZero();
}

GateRow const kGates[] = {
    {"ById", editById, nothing, 1, L"", L"after"},
    {"ByPointer", editByPointer, nothing, 1, L"", L"after"},
    {"LockedById", editById, lock, 3, L"on a locked layer", L"before"},
    {"LockedByPointer", editByPointer, lock, 3, L"on a locked layer", L"before"},
    {"WorkingSetById", editById, activateWorkingSet, 3, L"in the working set", L"before"},
    {"WorkingSetByPointer", editByPointer, activateWorkingSet, 3, L"in the working set", L"before"},
};

class Gates : public testing::TestWithParam<GateRow> {};
TEST_P(Gates, LetTextsThrough) {
    GateRow const& row = GetParam();
    OpenDrawing const drawing(kBlock);
    TzDbObjectId const id = postText();
    row.prepare(id);
    // An editor that edits another text keeps its own; it used to be null afterwards.
    EasyObject<TzDbMText> outer;
    gpText = &outer;
    EXPECT_EQ(row.edit(id), row.result);
    EXPECT_EQ(contentsOf(id).str(), row.contents);
    EXPECT_NE(drawing.transcript().find(row.shown), std::wstring::npos) << row.shown;
    EXPECT_EQ(std::exchange(gpText, nullptr), &outer);
}
INSTANTIATE_TEST_SUITE_P(Overloads, Gates, testing::ValuesIn(kGates), [](auto const& row) {
    return row.param.name;
});

TEST(Gate, ReportsWhatIsNoText) {
    OpenDrawing const drawing;
    TzDbObjectId const line = post(new TzDbLine);
    EXPECT_EQ(editById(line), 3);
    EXPECT_EQ(editById(TzDbObjectId()), 3);
    TzDbMText* const none = nullptr;
    EXPECT_EQ(InvokeEditorOn(none, kMTETabText, 0, true, true, false, false), 3);
    std::wstring const shown = drawing.transcript();
    int count = 0;
    for (std::size_t at = 0; (at = shown.find(L"no multi-line text", at)) != std::wstring::npos;
         ++at)
        ++count;
    EXPECT_EQ(count, 3);
}

TEST(Gate, LeavesTheOpeningAsItWas) {
    OpenDrawing const drawing(kBlock);
    gdJigBoundBoxHeight = 5;
    TzDbObjectId const id = postText();
    EasyObject<TzDbMText> text;
    ASSERT_EQ(tzdbOpenObject(text.object, id, TzDb::kForRead), Tzad::eOk);
    EXPECT_EQ(InvokeEditorOn(text, kMTETabText, 0, true, true, false, false, false), 1);
    EXPECT_TRUE(text->isReadEnabled());
    EXPECT_FALSE(text->isWriteEnabled());
    // The height of a dragged box is for texts that are in no drawing.
    EXPECT_EQ(drawing.events().find("\"16\":"), std::string::npos);
}

TEST(Gate, RefusesWhatItCannotWrite) {
    OpenDrawing const drawing(kBlock);
    TzDbObjectId const id = postText();
    EasyObject<TzDbMText> elsewhere;
    ASSERT_EQ(tzdbOpenObject(elsewhere.object, id, TzDb::kForRead), Tzad::eOk);
    EasyObject<TzDbMText> text;
    ASSERT_EQ(tzdbOpenObject(text.object, id, TzDb::kForRead), Tzad::eOk);
    EXPECT_EQ(InvokeEditorOn(text, kMTETabText, 0, true, true, false, false, false), 3);
    EXPECT_NE(drawing.events().find("cannot be opened for writing"), std::string::npos);
}

TzString fieldCodeOf(TzDbObjectId id) {
    EasyObject<TzDbMText> text;
    EasyObject<TzDbField> field;
    bool const has = tzdbOpenObject(text.object, id, TzDb::kForRead) == Tzad::eOk &&
                     text->getField(L"TEXT", field.object, TzDb::kForRead) == Tzad::eOk;
    return has ? field->getFieldCode(0) : TzString();
}

struct ContentsRow {
    char const* name;
    wchar_t const* before;
    char const* left;     // in the editor
    wchar_t const* code;  // of the field after the session; empty for none
    wchar_t const* contents;
    bool written;
};
constexpr ContentsRow kContents[] = {
    {"FieldKept", L"n=%<\\Var LUNITS>%", "m=%<\\Var LUNITS>%\nb", L"m=%<\\Var LUNITS>%\\Pb",
     L"m=2\\Pb", true},
    // The editors used to show "n=2" and to set it, which dropped the field.
    {"FieldUnchanged", L"n=%<\\Var LUNITS>%", "n=%<\\Var LUNITS>%", L"n=%<\\Var LUNITS>%", L"n=2",
     false},
    {"FieldDropped", L"n=%<\\Var LUNITS>%", "n=2", L"", L"n=2", true},
    // It used to be set, which made a step for undo.
    {"Unchanged", L"a\\Pb", "a\nb", L"", L"a\\Pb", false},
};
class EditedContents : public testing::TestWithParam<std::tuple<char const*, ContentsRow>> {};
TEST_P(EditedContents, KeepTheirFields) {
    auto const& [editor, row] = GetParam();
    OpenDrawing const drawing("<<<\n" + std::string(row.left) + "\n>>>\n");
    ASSERT_TRUE(tzhost::Variables::instance()
                    .overrideFromText(L"MTEXTED", TzString::fromUtf8(editor).str())
                    .isDone());
    auto* const text = new TzDbMText;
    ASSERT_EQ(text->setContents(row.before), Tzad::eOk);
    TzDbObjectId const id = post(text);
    std::size_t const posted = drawing.events().size();
    MteCoreDialogParamsRXInit();
    EXPECT_EQ(editById(id), 1);
    MteCoreDialogParamsRXUninit();
    EXPECT_EQ(contentsOf(id).str(), row.contents);
    EXPECT_EQ(fieldCodeOf(id).str(), row.code);
    bool const isWritten = drawing.events().find("\"write\"", posted) != std::string::npos;
    EXPECT_EQ(isWritten, row.written);
}
INSTANTIATE_TEST_SUITE_P(Editors,
                         EditedContents,
                         testing::Combine(testing::Values("Internal", "Internal-", "myeditor"),
                                          testing::ValuesIn(kContents)));

// A new text would have dropped the field unseen.
TEST(Gate, LeavesATextWhoseFieldIsOpenElsewhere) {
    OpenDrawing const drawing(kBlock);
    auto* const made = new TzDbMText;
    ASSERT_EQ(made->setContents(L"%<\\Var LUNITS>%"), Tzad::eOk);
    TzDbObjectId const id = post(made);
    {
        EasyObject<TzDbMText> text;
        ASSERT_EQ(tzdbOpenObject(text.object, id, TzDb::kForRead), Tzad::eOk);
        EasyObject<TzDbField> field;
        ASSERT_EQ(text->getField(L"TEXT", field.object, TzDb::kForWrite), Tzad::eOk);
        EXPECT_EQ(InvokeEditorOn(text, kMTETabText, 0, true, true, false, false, false), 2);
    }
    EXPECT_EQ(fieldCodeOf(id), L"%<\\Var LUNITS>%");
    EXPECT_NE(drawing.transcript().find(L"has a field that cannot be opened"), std::wstring::npos);
}

// What happens once, at a call of the host's.
struct Event {
    char const* name;
    std::string_view call;
    void (*action)();  // null: memory ends
    short fixedWindow;
    wchar_t const* contents;  // empty: an exception leaves the session
};

TzDbObjectId nextText;
void editNext() {
    EXPECT_EQ(editById(nextText), 1);
}

constexpr Event kEvents[] = {
    // The text was left open for read, and what was edited was lost without a word.
    {"ShownInAFixedWindow", "TzApHostDialogImp::run", SetVisibility, 1, L"{\\H2.5x;af\\H0.3x;ter}"},
    {"ShownByTheDialog", "TzApHostDialogImp::run", SetVisibility, 0, L"{\\H2.105x;af\\H0.3x;ter}"},
    // The height of the inner text counted: 0.06015.
    {"DialogInADialog", "TzApHostDialogImp::run", editNext, 0, L"{\\H2.105x;af\\H0.3x;ter}"},
    {"MemoryEndsInTheDialog", "TzApHostDialogImp::run", nullptr, 0, L""},
    // The program ended: the text that had not been hidden was to be shown again.
    {"MemoryEndsBeforeHiding", "TzDbEntity::setVisibility", nullptr, 0, L""},
};

class DuringASession : public testing::TestWithParam<Event> {
protected:
    static bool atCall(std::string_view operation, int&) {
        if (!due_) return !GetParam().action && operation == "operator new";
        if (operation != GetParam().call) return false;
        due_ = false;
        if (GetParam().action) GetParam().action();
        return false;
    }
    static bool due_;
};
bool DuringASession::due_;

TEST_P(DuringASession, TextEndsVisibleAndClosed) {
#ifdef __SANITIZE_ADDRESS__
    if (!GetParam().action) GTEST_SKIP() << "the sanitizer's own operator new serves in this build";
#endif
    std::string const block = "<<<\n{\\rtf1{\\fs80 af}ter}\n>>>\n";
    OpenDrawing const drawing(block + block);
    ASSERT_TRUE(tzhost::Variables::instance().overrideFromText(L"MTEXTED", L"OLDEDITOR").isDone());
    resbuf value{nullptr, Tzad::eResultShort, {}};
    value.resval.rint = GetParam().fixedWindow;
    ASSERT_EQ(tzedSetVar(L"MTEXTFIXED", &value), Tzad::ePromptNormal);
    TzDbObjectId const id = postText();
    nextText = postText();
    {
        EasyObject<TzDbMText> next;
        ASSERT_EQ(tzdbOpenObject(next.object, nextText, TzDb::kForWrite), Tzad::eOk);
        ASSERT_EQ(next->setTextHeight(7), Tzad::eOk);
    }
    tzhost::workingDrawing()->undoLog().begin();
    MteCoreDialogParamsRXInit();
    due_ = true;
    tzhost::FaultHook const before = tzhost::setFaultHook(atCall);
    bool hadMemory = true;
    try {
        tzhost::MemoryFaultScope const memory;
        EXPECT_EQ(editById(id), 1);
    } catch (std::bad_alloc const&) {
        hadMemory = false;
    }
    tzhost::setFaultHook(before);
    MteCoreDialogParamsRXUninit();
    tzhost::workingDrawing()->undoLog().end();
    EXPECT_EQ(hadMemory, GetParam().action != nullptr);
    EXPECT_EQ(contentsOf(id).str(), hadMemory ? GetParam().contents : L"before");
    EasyObject<TzDbMText> text;
    ASSERT_EQ(tzdbOpenObject(text.object, id, TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(text->visibility(), TzDb::kVisible);
}
INSTANTIATE_TEST_SUITE_P(Events, DuringASession, testing::ValuesIn(kEvents), [](auto const& row) {
    return row.param.name;
});

struct RecordRow {
    char const* name;
    int attributeInPlace;  // ATTIPE
    bool view;
    bool attribute;
    bool option13;
    bool option14;
    char const* settings;  // how the record begins
};
constexpr RecordRow kRecords[] = {
    {"View", 0, true, false, false, false, R"({"0":1,"5":1,"16":5.0,)"},
    {"NoView", 1, false, false, false, false, R"({"5":1,"16":5.0,)"},
    {"Attribute", 0, true, true, false, false, R"({"4":1,"5":1,"6":1,"16":5.0,)"},
    {"AttributeInPlace", 1, false, true, false, false, R"({"0":1,"4":1,"5":1,"16":5.0,)"},
    {"Option13", 0, true, false, true, false, R"({"0":1,"5":1,"12":8192,"16":5.0,)"},
    {"BothOptions", 0, true, false, true, true, R"({"0":1,"5":1,"12":24576,"16":5.0,)"},
};

class Records : public testing::TestWithParam<RecordRow> {};
TEST_P(Records, TellTheInPlaceEditor) {
    RecordRow const& row = GetParam();
    OpenDrawing const drawing(kBlock);
    resbuf value{nullptr, Tzad::eResultShort, {}};
    value.resval.rint = static_cast<short>(row.attributeInPlace);
    ASSERT_EQ(tzedSetVar(L"ATTIPE", &value), Tzad::ePromptNormal);
    gdJigBoundBoxHeight = 5;
    gbUsedIPE = 0;
    TzDbMText text;
    text.setDatabaseDefaults();
    EasyObject<TzDbMText> held(&text, EasyFlags::kNone);
    EXPECT_EQ(InvokeEditorOn(held, kMTETabText, 0, true, row.view, row.attribute, row.option13,
                             row.option14),
              1);
    EXPECT_EQ(gbUsedIPE, 1);
    EXPECT_NE(drawing.events().find(row.settings), std::string::npos) << drawing.events();
}
INSTANTIATE_TEST_SUITE_P(Arguments, Records, testing::ValuesIn(kRecords), [](auto const& row) {
    return row.param.name;
});

}  // namespace
