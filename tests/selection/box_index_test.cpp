// Picks, windows and crossings by the index of boxes against a walk over all, while the drawing
// changes under it in every way that moves a box.

#include <gtest/gtest.h>

#include <new>
#include <random>

#include "host/base/memory_faults.h"
#include "host/database/symbol_imp.h"
#include "host/database/user_system.h"
#include "host/faults/fault_plan.h"
#include "host/selection/pick.h"
#include "host/selection/selection_words.h"
#include "tests/selection/drawing_session.h"

namespace {

using tzhost::Depth;
using tzhost::FlatBox;
using tzhost::Outline;
using tzhost::Touch;
using tzhost::UserSystem;
using tzhost::Variables;
using tzhost::test::OpenDrawing;

// Two spaces and a block that are long enough for an index. B is referred to, and refers to C.
class BoxIndexes : public testing::Test {
protected:
    BoxIndexes() {
        layer_ = drawing_.id(drawing_.addLayer(L"L", false));
        style_ = addStyle();
        add(newReference(inner_), L"B");
        // The box of this diagonal is too large for a tree.
        (void)drawing_.addLine({-1, -1, 0}, {1, 1, 0}, L"D");
        auto* const huge = newReference(huge_);
        (void)huge->setScale(1e308);
        add(huge);
        hugeReference_ = entities_.back();
        for (int i = 0; i < 70; ++i) {
            (void)drawing_.drawing().setClayer(i % 4 == 0 ? layer_ : plain_);
            for (wchar_t const* const block : {L"B", kModelSpaceName, kPaperSpaceName})
                add(newLine(), block);
            if (i % 10 == 0) add(newReference(block_));
            if (i % 7 == 0) entities_.push_back(drawing_.addText(place(), L"Some words"));
            if (i % 20 == 0) add(newLines());
        }
    }

    std::size_t below(std::size_t end) { return random_() % end; }
    double coordinate() { return static_cast<double>(below(200)) / 10; }
    TzGePoint3d place() { return {coordinate(), coordinate(), coordinate() / 10}; }
    void add(TzDbEntity* entity, wchar_t const* block = kModelSpaceName) {
        entities_.push_back(drawing_.add(entity, block));
    }
    TzDbObjectId addStyle() {
        TzDbTextStyleTable* table = nullptr;
        TzDbObjectId id;
        auto* const style = new TzDbTextStyleTableRecord;
        (void)style->setName(L"Vertical");
        (void)style->setIsVertical(true);
        EXPECT_EQ(drawing_.drawing().getTextStyleTable(table, TzDb::kForWrite), Tzad::eOk);
        EXPECT_EQ(table->addRecord(style, id), Tzad::eOk);
        (void)style->close();
        (void)table->close();
        return id;
    }
    TzDbLine* newLine() {
        auto* const line = new TzDbLine;
        TzGePoint3d const start = place();
        (void)line->setStartPoint(start);
        (void)line->setEndPoint(start + TzGeVector3d(coordinate() / 10, coordinate() / 10, 0));
        return line;
    }
    TzDbBlockReference* newReference(TzDbObjectId block) {
        auto* const reference = new TzDbBlockReference;
        (void)reference->setBlockTableRecord(block);
        (void)reference->setPosition(place());
        (void)reference->setRotation(coordinate());
        return reference;
    }
    // Its lines name no style, so that they show the current one.
    TzDbAttributeDefinition* newLines() {
        auto* const definition = new TzDbAttributeDefinition;
        auto* const lines = new TzDbMText;
        (void)lines->setTextHeight(3);
        (void)lines->setContents(L"Lines");
        (void)lines->setLocation(place());
        EXPECT_EQ(definition->setMTextAttributeDefinition(lines), Tzad::eOk);
        return definition;
    }
    void addAttribute(TzDbBlockReference& reference) {
        auto attribute = std::make_unique<TzDbAttribute>();
        (void)attribute->setPosition(place());
        (void)attribute->setTextString(L"WW");
        TzDbObjectId id;
        if (reference.appendAttribute(id, attribute.get()) == Tzad::eOk)
            (void)attribute.release()->close();
        entities_.push_back(OpenDrawing::handle(id));
    }
    template <class Object, class Change>
    void change(TzDbObjectId id, Change const& change) {
        Object* object = nullptr;
        if (tzdbOpenObject(object, id, TzDb::kForWrite, true) != Tzad::eOk) return;
        change(*object);
        (void)object->close();
    }
    void changeAny() {
        TzDbObjectId const id = drawing_.id(entities_[below(entities_.size())]);
        TzGeVector3d const by(coordinate() - 10, 1, 0);
        // Most changes leave the index standing.
        switch (below(4) > 0 ? below(9) : 9 + below(10)) {
        case 0: return add(newLine(), below(2) == 0 ? kModelSpaceName : newest_.c_str());
        case 1:
            if (below(2) == 0) return add(newReference(inner_));
            newest_ = L"N" + std::to_wstring(entities_.size());
            return add(newReference(drawing_.addBlock(newest_.c_str())));
        case 2:
            return change<TzDbEntity>(id, [](auto& each) { (void)each.erase(!each.isErased()); });
        case 3:
            return change<TzDbEntity>(id, [](auto& each) {
                bool const isSeen = each.visibility() == TzDb::kVisible;
                (void)each.setVisibility(isSeen ? TzDb::kInvisible : TzDb::kVisible);
            });
        case 4: return change<TzDbMText>(id, [](auto& text) { (void)text.setContents(L"Other"); });
        case 5: return change<TzDbEntity>(id, [&](auto& each) { (void)each.setLayer(layer_); });
        case 6:
            (void)drawing_.drawing().setTextstyle(
                drawing_.drawing().textstyle() == style_ ? standard_ : style_);
            return;
        case 7:
            return change<TzDbLayerTableRecord>(
                layer_, [](auto& each) { (void)each.setIsOff(!each.isOff()); });
        case 8:
            return change<TzDbBlockReference>(drawing_.id(hugeReference_),
                                              [&](auto& each) { addAttribute(each); });
        case 9: return add(newLine(), below(2) == 0 ? L"B" : L"C");
        case 10: return add(newReference(inner_), kPaperSpaceName);
        case 11:
            return change<TzDbTextStyleTableRecord>(
                drawing_.drawing().textstyle(),
                [&](auto& each) { (void)each.setXScale(1 + coordinate() / 10); });
        case 12:
            return change<TzDbBlockTableRecord>(below(2) == 0 ? block_ : inner_,
                                                [&](auto& each) { (void)each.setOrigin(place()); });
        case 13:
            return change<TzDbLayerTableRecord>(
                layer_, [](auto& each) { (void)each.setIsLocked(!each.isLocked()); });
        case 14:
            (void)tzhost::setUserSystem(below(2) == 0
                                            ? UserSystem{{4, -4, 1}, {0.6, 0.8, 0}, {-0.8, 0.6, 0}}
                                            : UserSystem());
            return;
        case 15: {
            auto const model = static_cast<short>(below(3) == 0 ? 0 : 1);
            (void)Variables::instance().set(L"TILEMODE", model, tzhost::Writer::user);
            return;
        }
        default:
            return change<TzDbEntity>(
                id, [&](auto& each) { (void)each.transformBy(TzGeMatrix3d::translation(by)); });
        }
    }

    using Ids = tzhost::EntityIds;
    static std::string
    say(std::optional<tzhost::Picked> const& picked, Ids const& in, Ids const& by) {
        std::string all = picked ? OpenDrawing::handle(picked->top) : "-";
        for (Ids const* const ids : {&in, &by}) {
            all += ";";
            for (TzDbObjectId const id : *ids)
                all += " " + OpenDrawing::handle(id);
        }
        return all;
    }
    // What a pick, a window and a crossing find.
    static std::string found(TzGePoint3d const& at) {
        FlatBox const box{at.convert2d(), {at.x + 6, at.y + 8}};
        return say(tzhost::pickAt(at, Depth::top), tzhost::entitiesIn(box, Touch::within),
                   tzhost::entitiesIn(box, Touch::crossing));
    }
    // The same by a look at each entity.
    static std::string walked(TzGePoint3d const& at) {
        FlatBox const box{at.convert2d(), {at.x + 6, at.y + 8}};
        std::optional<tzhost::Picked> picked;
        Ids in, by;
        for (TzDbObjectId const id : tzhost::entitiesOfActiveSpace()) {
            Outline const outline = Outline::of(*tzhost::entityOf(id));
            if (outline.boxHolds(at.convert2d())) picked = {id, id, {}, {}};
            if (outline.isWithin(box)) in.append(id);
            if (outline.touches(box)) by.append(id);
        }
        return say(picked, in, by);
    }
    static std::string foundInside(TzGePoint3d const& at) {
        auto const picked = tzhost::pickAt(at, Depth::nested);
        return picked ? OpenDrawing::handle(picked->id) : "-";
    }

    OpenDrawing drawing_;
    TzDbObjectId inner_ = drawing_.addBlock(L"C"), block_ = drawing_.addBlock(L"B"),
                 huge_ = drawing_.addBlock(L"D"), layer_, style_;
    TzDbObjectId plain_ = drawing_.drawing().clayer(), standard_ = drawing_.drawing().textstyle();
    std::string hugeReference_;
    std::wstring newest_ = L"C";  // block
    std::vector<std::string> entities_;
    std::mt19937 random_{11};
};

TEST_F(BoxIndexes, FindWhatAWalkFinds) {
    auto& log = drawing_.drawing().undoLog();
    for (int turn = 0; turn < 250; ++turn) {
        TzGePoint3d const at = place();
        (void)found(at);  // the index is there now
        (void)foundInside(at);
        for (std::size_t steps = below(3); steps > 0; --steps) {
            log.begin();
            for (std::size_t left = below(3); left > 0; --left)
                changeAny();
            (void)log.end();
        }
        bool const isTakenBack = below(3) == 0;
        for (std::size_t left = isTakenBack ? below(4) : 0; left > 0; --left)
            (void)log.takeBack();
        for (std::size_t left = isTakenBack ? below(4) : 0; left > 0; --left)
            (void)log.doAgain();
        ASSERT_EQ(found(at), walked(at)) << "turn " << turn;
        if (turn % 3 != 0) continue;
        std::string const inside = foundInside(at);
        tzhost::noteLooksChanged();  // the next answer comes from a walk
        ASSERT_EQ(inside, foundInside(at)) << "turn " << turn;
        auto const other = tzhost::Drawing::create();
        tzhost::setWorkingDrawing(other.get());
        EXPECT_EQ(found(at), "-;;");
        tzhost::setWorkingDrawing(&drawing_.drawing());
    }
}

// Three corners of this text are no numbers; what lay to its left crossed it.
TEST_F(BoxIndexes, LeaveOutWhatGoesBeyondDoubles) {
    auto* const text = new TzDbMText;
    (void)text->setNormal(-TzGeVector3d::kYAxis);
    (void)text->setLocation({1.6e308, 0, 0});
    (void)text->setTextHeight(1e306);
    (void)text->setContents(L"Sixty letters that reach farther than any double can tell");
    add(text);
    (void)tzhost::setUserSystem({{0, 0, 0}, {0, 1, 0}, {0, 0, 1}});
    EXPECT_EQ(tzhost::entitiesIn({{-5, -31}, {-4, -30}}, Touch::crossing).length(), 0);
}

TEST_F(BoxIndexes, DoNotKnowWhatAModuleDeletes) {
    std::string const line = drawing_.addLine({500, 500, 0}, {501, 501, 0});
    TzGePoint3d const at(500, 500, 0);
    for (int i = 0; i < 3; ++i)
        (void)found(at);
    TzDbObject* object = nullptr;
    ASSERT_EQ(tzdbOpenObject(object, drawing_.id(line), TzDb::kForWrite), Tzad::eOk);
    delete object;
    EXPECT_EQ(found(at), walked(at));
}

// Whichever allocation fails, the next answers are the same.
TEST_F(BoxIndexes, OutliveAFailingAllocation) {
#ifdef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "the sanitizer has an operator new of its own";
#endif
    TzGePoint3d const at(10, 10, 0);
    for (long number = 1;; number += 1 + number / 16) {
        tzhost::noteLooksChanged();  // the index begins anew
        add(newLine());
        tzhost::FaultPlan plan;
        ASSERT_EQ(plan.add("operator new:" + std::to_string(number)), std::nullopt);
        plan.install();
        try {
            tzhost::MemoryFaultScope const scope;
            (void)found(at);
        } catch (std::bad_alloc const&) {  // where a walk fails too
        }
        plan.remove();
        ASSERT_EQ(found(at), walked(at)) << number;
        if (!plan.hasStruck()) return;
    }
}

}  // namespace
