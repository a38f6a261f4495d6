#include <new>

#include "host/base/audit.h"
#include "host/base/event_sink.h"
#include "host/base/memory_faults.h"
#include "host/faults/fault_plan.h"
#include "tests/database/drawing_fixture.h"
#include "tz/db/field.h"
#include "tz/ed/ucs.h"

using tzhost::test::DrawingTest;

namespace {

// Gives back on every way out, as a module's holders do.
struct SystemHolder {
    bool held = false;
    ~SystemHolder() {
        if (held) (void)tzedRestorePreviousUCS();
    }
};
struct TextHolder {
    TzDbMText* text = nullptr;
    ~TextHolder() {
        if (!text) return;
        (void)text->unhighlight();
        (void)text->close();
    }
};

// A command that adds a text with a field, replaces the field of one, and works in a system of its
// own.
void work(tzhost::Drawing& drawing, TzDbObjectId id) {
    SystemHolder system;
    system.held = tzedSetCurrentUCS(TzGeMatrix3d::rotation(1, TzGeVector3d::kXAxis)) == 0;
    TextHolder holder;
    if (tzdbOpenObject(holder.text, id, TzDb::kForWrite) != Tzad::eOk) return;
    (void)holder.text->highlight();
    auto field = std::make_unique<TzDbField>();
    TzDbObjectId added;
    if (field->setFieldCode(L"%<\\Var LUPREC>%", 0, nullptr) == Tzad::eOk &&
        holder.text->setField(L"TEXT", field.get(), added) == Tzad::eOk)
        (void)field.release()->close();
    (void)holder.text->setContents(L"%<\\Var LUNITS>% and a text that needs memory");
    std::unique_ptr<TzDbObject> const copy(holder.text->clone());
    auto fresh = std::make_unique<TzDbMText>();
    fresh->setDatabaseDefaults(&drawing);
    (void)fresh->setContents(L"another text with a %<\\Var LUPREC>%");
    TzDbBlockTableRecord* space = nullptr;
    if (tzdbOpenObject(space, drawing.modelSpace(), TzDb::kForWrite) != Tzad::eOk) return;
    struct Closer {
        TzDbObject* object;
        ~Closer() { (void)object->close(); }
    } const closer{space};
    if (space->appendTzDbEntity(added, fresh.get()) == Tzad::eOk) (void)fresh.release()->close();
}

// Whichever allocation fails, nothing stays lent, and undo brings the drawing back.
TEST_F(DrawingTest, EveryFailingAllocationIsSurvived) {
#ifdef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "the sanitizer's own operator new serves in this build";
#endif
    TzDbObjectId const id = addText(L"%<\\Var LUNITS>%");
    auto const before = tzhost::setEventSink([](tzhost::Event const&) {});
    bool struck = true;
    int call = 0;
    while (struck && ++call < 2000) {
        tzhost::FaultPlan plan;
        ASSERT_FALSE(plan.add("operator new:" + std::to_string(call)));
        drawing->undoLog().begin();
        plan.install();
        try {
            tzhost::MemoryFaultScope const scope;
            work(*drawing, id);
        } catch (std::bad_alloc const&) {
            EXPECT_TRUE(plan.hasStruck());
        }
        plan.remove();
        struck = plan.hasStruck();
        drawing->undoLog().end();
        ASSERT_TRUE(tzhost::audit().clean()) << call << ": " << tzhost::audit().openObjects;
        while (drawing->undoLog().takeBack()) {
        }
        ASSERT_EQ(list(), "1 MTEXT 0") << call;
        ASSERT_EQ(at<TzDbMText>(id).contents(), L"2") << call;
        ASSERT_EQ(drawing->ucsydir(), TzGeVector3d::kYAxis) << call;
    }
    EXPECT_FALSE(struck) << "the sweep came to its end";
    EXPECT_GT(call, 20) << "the plan reached the allocations";
    tzhost::setEventSink(before);
}

}  // namespace
