#include "host/settings/variables.h"
#include "tests/database/drawing_fixture.h"
#include "tz/db/field.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"
#include "tz/ed/ucs.h"

using tzhost::Variables;
using tzhost::test::DrawingFixture;
using tzhost::test::DrawingTest;

namespace {

// What a command does, and a view of the drawing that must be the same before it and after undo.
struct Deed {
    char const* name;
    void (*act)(DrawingFixture& fixture, TzDbObjectId text);
};

template <class T>
void change(TzDbObjectId id, Tzad::ErrorStatus (*act)(T& object)) {
    T* object = nullptr;
    ASSERT_EQ(tzdbOpenObject(object, id, TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(act(*object), Tzad::eOk);
    EXPECT_EQ(object->close(), Tzad::eOk);
}

Deed const kDeeds[] = {
    {"Append", [](DrawingFixture& f, TzDbObjectId) { f.addText(L"new"); }},
    {"AppendMany",
     [](DrawingFixture& f, TzDbObjectId) {
         for (int i = 0; i < 5; ++i)
             f.add(new TzDbLine);
     }},
    {"Erase",
     [](DrawingFixture&, TzDbObjectId id) {
         change<TzDbMText>(id, [](TzDbMText& text) { return text.erase(); });
     }},
    {"ChangeTwice",
     [](DrawingFixture&, TzDbObjectId id) {
         change<TzDbMText>(id, [](TzDbMText& text) { return text.setContents(L"one"); });
         change<TzDbMText>(id, [](TzDbMText& text) {
             EXPECT_EQ(text.setContents(L"two"), Tzad::eOk);
             EXPECT_EQ(text.setStaticColumns(3, 1, 2), Tzad::eOk);
             return text.setBackgroundFill(true);
         });
     }},
    {"Move",
     [](DrawingFixture&, TzDbObjectId id) {
         change<TzDbMText>(id, [](TzDbMText& text) {
             return text.transformBy(TzGeMatrix3d::translation({1, 2, 3}));
         });
     }},
    {"Field",
     [](DrawingFixture&, TzDbObjectId id) {
         change<TzDbMText>(id,
                           [](TzDbMText& text) { return text.setContents(L"%<\\Var LUNITS>%"); });
     }},
    {"Layer",
     [](DrawingFixture& f, TzDbObjectId id) {
         TzDbObjectId const layer = f.addLayer(L"New");
         TzDbMText* text = nullptr;
         ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForWrite), Tzad::eOk);
         EXPECT_EQ(text->setLayer(layer), Tzad::eOk);
         EXPECT_EQ(text->close(), Tzad::eOk);
         EXPECT_EQ(f.drawing->setClayer(layer), Tzad::eOk);
     }},
    {"Rename",
     [](DrawingFixture& f, TzDbObjectId) {
         change<TzDbLayerTableRecord>(f.drawing->clayer(), [](TzDbLayerTableRecord& layer) {
             return layer.setName(L"Walls");
         });
     }},
    {"Style",
     [](DrawingFixture& f, TzDbObjectId) {
         change<TzDbTextStyleTableRecord>(
             f.drawing->textstyle(),
             [](TzDbTextStyleTableRecord& style) { return style.setXScale(2.0); });
     }},
    {"Variables",
     [](DrawingFixture&, TzDbObjectId) {
         (void)Variables::instance().set(L"TEXTSIZE", 7.5, tzhost::Writer::module);
         (void)Variables::instance().set(L"TILEMODE", short{0}, tzhost::Writer::user);
     }},
    {"UserSystem",
     [](DrawingFixture&, TzDbObjectId) {
         TzGeMatrix3d const turned = TzGeMatrix3d::rotation(0.5, TzGeVector3d::kXAxis);
         ASSERT_EQ(tzedSetCurrentUCS(turned), 0);
         ASSERT_EQ(tzedSetCurrentUCS(TzGeMatrix3d()), 0);
         EXPECT_EQ(tzedRestorePreviousUCS(), 0);
     }},
};

class Undo : public testing::TestWithParam<Deed>, protected DrawingFixture {
protected:
    std::string view() {
        std::string text = list();
        TzDbMText const& lines = at<TzDbMText>(id_);
        text += '\n' + lines.contents().toUtf8() + ' ' + std::to_string(lines.location().x) + ' ' +
                std::to_string(lines.columns().columnCount) + ' ' +
                std::to_string(lines.backgroundFillOn()) + ' ' +
                std::to_string(lines.actualWidth()) + '\n';
        TzDbField* field = nullptr;
        text += std::to_string(lines.getField(L"TEXT", field, TzDb::kForRead));
        if (field) {
            EXPECT_EQ(field->close(), Tzad::eOk);
        }
        for (auto const& [name, value] : Variables::instance().kept(tzhost::KeptIn::drawing))
            text += '\n' + TzString(name).toUtf8() + TzString(tzhost::writeValue(value)).toUtf8();
        text += '\n' + std::to_string(drawing->ucsydir().z);
        for (wchar_t const* const layer : {L"0", L"New", L"Walls"}) {
            TzDbLayerTable* table = nullptr;
            EXPECT_EQ(drawing->getLayerTable(table, TzDb::kForRead), Tzad::eOk);
            text += table->has(layer) ? " yes" : " no";
            EXPECT_EQ(table->close(), Tzad::eOk);
        }
        return text;
    }

    TzDbObjectId id_ = addText(L"abc");
};

TEST_P(Undo, TakesBackAndDoesAgain) {
    std::string const before = view();
    drawing->undoLog().begin();
    GetParam().act(*this, id_);
    drawing->undoLog().end();
    std::string const after = view();
    for (int round = 0; round < 2; ++round) {
        EXPECT_TRUE(drawing->undoLog().takeBack());
        EXPECT_EQ(view(), before);
        EXPECT_FALSE(drawing->undoLog().takeBack());
        EXPECT_TRUE(drawing->undoLog().doAgain());
        EXPECT_EQ(view(), after);
        EXPECT_FALSE(drawing->undoLog().doAgain());
    }
    while (tzedRestorePreviousUCS() == 0) {
    }
}

INSTANTIATE_TEST_SUITE_P(Deeds, Undo, testing::ValuesIn(kDeeds), [](auto const& row) {
    return row.param.name;
});

// Commands that leave all as it was. Each used to be a step, so U seemed to do nothing.
Deed const kIdleDeeds[] = {
    {"SameValue",
     [](DrawingFixture&, TzDbObjectId id) {
         change<TzDbMText>(id, [](TzDbMText& text) { return text.setContents(L"abc"); });
     }},
    {"ThereAndBack",
     [](DrawingFixture&, TzDbObjectId id) {
         for (auto const seen : {TzDb::kInvisible, TzDb::kVisible}) {
             TzDbMText* text = nullptr;
             ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForWrite), Tzad::eOk);
             EXPECT_EQ(text->setVisibility(seen), Tzad::eOk);
             EXPECT_EQ(text->close(), Tzad::eOk);
         }
     }},
    {"AppendAndErase",
     [](DrawingFixture& f, TzDbObjectId) {
         change<TzDbMText>(f.addText(L"new"), [](TzDbMText& text) { return text.erase(); });
     }},
    {"SameStyle",
     [](DrawingFixture& f, TzDbObjectId) {
         change<TzDbTextStyleTableRecord>(
             f.drawing->textstyle(),
             [](TzDbTextStyleTableRecord& style) { return style.setXScale(style.xScale()); });
     }},
};

class IdleCommands : public Undo {};

TEST_P(IdleCommands, AreNoStep) {
    std::string const before = view();
    drawing->undoLog().begin();
    GetParam().act(*this, id_);
    drawing->undoLog().end();
    EXPECT_EQ(view(), before);
    EXPECT_TRUE(drawing->undoLog().isEmpty());
}

INSTANTIATE_TEST_SUITE_P(Deeds, IdleCommands, testing::ValuesIn(kIdleDeeds), [](auto const& row) {
    return row.param.name;
});

// A move by less than the tolerance of points is a change all the same.
TEST_F(DrawingTest, SmallestMoveIsAStep) {
    TzDbObjectId const id = addText(L"abc");
    drawing->undoLog().begin();
    change<TzDbMText>(id, [](TzDbMText& text) { return text.setLocation({1e-12, 0, 0}); });
    drawing->undoLog().end();
    EXPECT_TRUE(drawing->undoLog().takeBack());
    EXPECT_EQ(at<TzDbMText>(id).location().x, 0.0);
}

// The earlier field used to stay erased.
TEST_F(DrawingTest, ReplacedFieldComesBack) {
    TzDbObjectId const id = addText(L"%<\\Var LUNITS>%");
    drawing->undoLog().begin();
    TzDbMText* text = nullptr;
    ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForWrite), Tzad::eOk);
    auto* field = new TzDbField;
    ASSERT_EQ(field->setFieldCode(L"%<\\Var LUPREC>%", 0, nullptr), Tzad::eOk);
    TzDbObjectId added;
    ASSERT_EQ(text->setField(L"TEXT", field, added), Tzad::eOk);
    EXPECT_EQ(field->close(), Tzad::eOk);
    EXPECT_EQ(text->close(), Tzad::eOk);
    drawing->undoLog().end();
    EXPECT_TRUE(drawing->undoLog().takeBack());
    ASSERT_EQ(at<TzDbMText>(id).getField(L"TEXT", field, TzDb::kForRead), Tzad::eOk);
    EXPECT_EQ(field->getFieldCode(0), L"%<\\Var LUNITS>%");
    EXPECT_EQ(field->close(), Tzad::eOk);
}

TEST_F(DrawingTest, UndoGoesStepByStep) {
    auto& log = drawing->undoLog();
    for (wchar_t const* const text : {L"a", L"b"}) {
        log.begin();
        addText(text);
        log.end();
    }
    log.begin();  // a command that changes nothing is no step
    log.end();
    log.begin();  // nor is one that only picks
    (void)Variables::instance().set(L"LASTPOINT", tzhost::VariablePoint{1, 2, 0},
                                    tzhost::Writer::host);
    log.end();
    log.begin();
    EXPECT_TRUE(log.takeBack());
    log.end();
    EXPECT_EQ(list(), "1 MTEXT 0");
    EXPECT_TRUE(log.takeBack());
    EXPECT_EQ(list(), "");
    EXPECT_FALSE(log.takeBack());
}

}  // namespace
