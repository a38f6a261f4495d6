// The field that an editor session leaves in the holder of its text: the drawing gets it, or it is
// deleted, whatever comes after the session.

#include "module/edit/session_field.h"

#include <gtest/gtest.h>

#include <new>

#include "host/base/fault_point.h"
#include "host/base/memory_faults.h"
#include "module/host_calls/space_posting.h"
#include "tests/mtext/held_text.h"
#include "tz/db/block_table.h"
#include "tz/db/field.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"

namespace {

struct CountedField : TzDbField {
    CountedField() { ++alive; }
    ~CountedField() override { --alive; }
    static int alive;
};
int CountedField::alive = 0;

enum class Memory { lasts, endsBehindTheSession };

// While it lives, each session of the editor in place leaves a field in the text's holder.
class LeavesFields {
public:
    explicit LeavesFields(Memory behind) {
        CountedField::alive = 0;
        memory_ = behind;
        before_ = tzhost::setFaultHook(atCall);
    }
    LeavesFields(LeavesFields const&) = delete;
    LeavesFields& operator=(LeavesFields const&) = delete;
    ~LeavesFields() { tzhost::setFaultHook(before_); }

private:
    static bool atCall(std::string_view operation, int&) {
        if (operation == "IPEInvokeEditorOn") gpText->field = new CountedField;
        bool const isBehind = CountedField::alive > 0 && gpText == nullptr;
        return memory_ == Memory::endsBehindTheSession && isBehind && operation == "operator new";
    }

    static Memory memory_;
    tzhost::FaultHook before_;
};
Memory LeavesFields::memory_;

TzDbObjectId theOnlyText() {
    EasyObject<TzDbBlockTableRecord> space;
    TzArray<TzDbObjectId> ids;
    if (tzdbOpenObject(space.object, tzhost::workingDrawing()->modelSpace(), TzDb::kForRead) ==
        Tzad::eOk)
        space->entities(ids);
    return ids.length() == 1 ? ids.first() : TzDbObjectId();
}

bool hasField(TzDbObjectId id) {
    EasyObject<TzDbMText> text;
    EasyObject<TzDbField> field;
    return tzdbOpenObject(text.object, id, TzDb::kForRead) == Tzad::eOk &&
           text->getField(kTextFieldKey, field.object, TzDb::kForRead) == Tzad::eOk;
}

void makeText() {
    TzxMtextCommand command;
    command.boxDragged = true;
    (void)command.CreateObject(nullptr, false);
}

void makeAttribute() {
    TzDbMText text;
    TzxMtextCommand command;
    (void)command.CreateObject(&text, true);
}

void editOutsideTheDrawing() {
    TzDbMText text;
    text.setDatabaseDefaults();
    (void)InvokeEditorOn(&text, kMTETabText, 0, true, true, false, false);
}

// The text is in the drawing and open for write.
void editForAnotherModule() {
    auto* const made = new TzDbMText;
    made->setDatabaseDefaults();
    TzDbObjectId id;
    ASSERT_EQ(postToDb(made, id, false), Tzad::eOk);
    EasyObject<TzDbMText> text;
    ASSERT_EQ(tzdbOpenObject(text.object, id, TzDb::kForWrite), Tzad::eOk);
    (void)TzadEditMTextEntity(nullptr, kMTETabText, text.object, 0, 0, true, true);
}

struct FieldRow {
    char const* name;
    void (*edit)();
    char const* script;
    Memory memory;
    bool attached;
};
constexpr char const* kAccepts = "<<<\nafter\n>>>\n";
constexpr char const* kLeaves = "<<<\nafter\n>>>cancel\n";
constexpr FieldRow kFields[] = {
    {"NewText", makeText, kAccepts, Memory::lasts, true},
    {"NewTextLeft", makeText, kLeaves, Memory::lasts, false},
    {"NewTextWithoutMemory", makeText, kAccepts, Memory::endsBehindTheSession, false},
    {"Attribute", makeAttribute, kAccepts, Memory::lasts, false},
    // A text outside the drawing has no place for a field; this one used to be lost.
    {"TextOutsideTheDrawing", editOutsideTheDrawing, kAccepts, Memory::lasts, false},
    {"AnotherModule", editForAnotherModule, kAccepts, Memory::lasts, true},
    {"AnotherModuleLeft", editForAnotherModule, kLeaves, Memory::lasts, false},
};

class SessionFields : public testing::TestWithParam<FieldRow> {};
TEST_P(SessionFields, AreAttachedOrDeleted) {
    FieldRow const& row = GetParam();
#ifdef __SANITIZE_ADDRESS__
    if (row.memory == Memory::endsBehindTheSession)
        GTEST_SKIP() << "the sanitizer's own operator new serves in this build";
#endif
    OpenDrawing const drawing(row.script);
    bool hadMemory = true;
    try {
        LeavesFields const session(row.memory);
        tzhost::MemoryFaultScope const memory;
        row.edit();
    } catch (std::bad_alloc const&) {
        hadMemory = false;
    }
    EXPECT_EQ(hadMemory, row.memory == Memory::lasts);
    EXPECT_EQ(CountedField::alive, row.attached ? 1 : 0);
    EXPECT_EQ(hasField(theOnlyText()), row.attached);
}
INSTANTIATE_TEST_SUITE_P(Ways, SessionFields, testing::ValuesIn(kFields), [](auto const& row) {
    return row.param.name;
});

}  // namespace
