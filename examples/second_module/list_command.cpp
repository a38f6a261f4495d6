// MARKLIST: lists the texts that the user selects. While the selection is pending, its word Layers
// lists the layers of the drawing.

#include "bodies.h"
#include "posting.h"
#include "tz/ap/document.h"
#include "tz/ap/gesture.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/db/mtext.h"
#include "tz/ed/print.h"
#include "tz/ed/prompts.h"
#include "tz/ed/selection.h"
#include "tz/ed/selection_filter.h"
#include "tz/ed/variables.h"
#include "tz/ed/view.h"
#include "tz/mte/easy_object.h"
#include "tz/mte/font_map_database.h"
#include "tz/rx/resbuf.h"
#include "tz/rx/status.h"
#include "tz/text/font_info.h"

namespace marks {
namespace {

using Tzworks::Tzdraft::TzApGesture::DragGestureOverruleHandler;

// Hidden texts stay out of every selection while this is installed.
class VisibleTexts : public TzEdSSGetFilter {
public:
    explicit VisibleTexts(TzApDocument* document) : document_(document) {
        addSSgetFilterInputContextReactor(document_, this, 1);
    }
    VisibleTexts(VisibleTexts const&) = delete;
    VisibleTexts& operator=(VisibleTexts const&) = delete;
    ~VisibleTexts() override { removeSSgetFilterInputContextReactor(document_, this); }

    void ssgetAddFilter(int /*flags*/,
                        TzEdSelectionSetService& service,
                        TzArray<TzDbObjectId> const& /*selectionSet*/,
                        TzArray<TzDbObjectId> const& added) override {
        for (int index = 0; index < added.length(); ++index) {
            EasyObject<TzDbEntity> entity;
            if (tzdbOpenObject(entity.object, added[index], TzDb::kForRead) != Tzad::eOk) continue;
            if (entity->visibility() == TzDb::kInvisible) service.remove(index);
        }
    }

private:
    TzApDocument* document_;
};

// A press and drag gives a box while this lives.
class BoxGesture {
public:
    explicit BoxGesture(TzApDocument& document) : handler_(document.view()) {
        handler_.view()->gestureProcessor()->addOverruleHandler(&handler_);
    }
    BoxGesture(BoxGesture const&) = delete;
    BoxGesture& operator=(BoxGesture const&) = delete;
    ~BoxGesture() { handler_.view()->gestureProcessor()->removeOverruleHandler(&handler_); }

private:
    DragGestureOverruleHandler handler_;
};

resbuf* listLayers(wchar_t const* /*keyword*/) {
    TzDbDatabase* const database = tzdbHostApplicationServices()->workingDatabase();
    EasyTable<TzDbLayerTable> layers;
    if (!database || database->getLayerTable(layers.object, TzDb::kForRead) != Tzad::eOk)
        return nullptr;
    EasyIterator<TzDbLayerTable, TzDbSymbolTableIterator> walk;
    if (layers->newIterator(walk.object) != Tzad::eOk) return nullptr;
    for (; !walk->done(); walk->step()) {
        EasyObject<TzDbLayerTableRecord> layer;
        if (tzdbOpenObject(layer.object, walk->getRecordId(), TzDb::kForRead) == Tzad::eOk)
            tzutPrintf(L"\nLayer \"%ls\"%ls", layer->getName(),
                       layer->isLocked() ? L", locked" : L"");
    }
    tzutPrintf(L"\n");
    return nullptr;
}

// Takes the words of selections while it lives.
class LayersWord {
public:
    LayersWord() {
        tzedSSGetKwordCallbackPtr(&before_);
        tzedSSSetKwordCallbackPtr(listLayers);
        tzedInitGet(0, L"Layers");
    }
    LayersWord(LayersWord const&) = delete;
    LayersWord& operator=(LayersWord const&) = delete;
    ~LayersWord() { tzedSSSetKwordCallbackPtr(before_); }

private:
    TzedSSKeywordCallback before_ = nullptr;
};

// A selection set, freed at the end.
class Selection {
public:
    Selection() = default;
    Selection(Selection const&) = delete;
    Selection& operator=(Selection const&) = delete;
    ~Selection() {
        if (isHeld_) tzedSSFree(name_);
    }

    bool ask() {
        resbuf* const texts = tzutNewRb(0);
        texts->resval.rstring = tzutNewString(L"MTEXT");
        wchar_t const* const prompts[] = {L"\nTexts to list or [Layers]: ",
                                          L"\nTexts to leave out: "};
        isHeld_ = tzedSSGet(L":$:K", prompts, nullptr, texts, name_) == Tzad::ePromptNormal;
        tzutRelRb(texts);
        return isHeld_;
    }
    [[nodiscard]] int length() const {
        int count = 0;
        return tzedSSLength(name_, &count) == Tzad::ePromptNormal ? count : 0;
    }
    [[nodiscard]] TzDbObjectId at(int index) const {
        long long entity[2]{};
        TzDbObjectId id;
        if (tzedSSName(name_, index, entity) != Tzad::ePromptNormal ||
            tzdbGetObjectId(id, entity) != Tzad::eOk)
            return {};
        return id;
    }

private:
    long long name_[2]{};
    bool isHeld_ = false;
};

// The face that a text style draws with: its own, or what the font map gives for its font file.
TzString faceOf(TzDbObjectId styleId) {
    EasyObject<TzDbTextStyleTableRecord> style;
    if (tzdbOpenObject(style.object, styleId, TzDb::kForRead) != Tzad::eOk) return L"?";
    TzString face;
    bool bold = false;
    bool italic = false;
    int number = 0;
    int pitch = 0;
    if (style->font(face, bold, italic, number, pitch) == Tzad::eOk && !face.isEmpty()) {
        CStdStrW file;
        tzFontInfo().FontNameToFile(CStdStrW(face), bold, italic, file);
        return face + L" in " + file.c_str();
    }
    CMTextFontMapDatabase fonts(0);
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    Charset charset = kAnsiCharset;
    CStdStrW const mapped =
        fonts.MapFileToFont(type, CStdStrW(style->fileName()), bold, italic, charset, pitch);
    return TzString(mapped.c_str()) + L" for " + style->fileName().kwszPtr();
}

void listText(TzDbMText const& text) {
    tzutPrintf(L"\n#%llX %ls at %ls", static_cast<unsigned long long>(text.objectId().handle()),
               text.contents().kwszPtr(), inUserUnits(text.location()).kwszPtr());
    resbuf viewport{};
    POINT pixel{};
    if (tzedGetVar(L"CVPORT", &viewport) == Tzad::ePromptNormal &&
        tzedCoordFromWorldToPixel(viewport.resval.rint, text.location(), pixel))
        tzutPrintf(L", pixel %d, %d", pixel.x, pixel.y);
    tzutPrintf(L", %ls\n", faceOf(text.textStyle()).kwszPtr());
}

}  // namespace

void listCommand() {
    TzApDocument* const document = tzDocManagerPtr()->curDocument();
    if (!document) return;
    Selection selection;
    {
        VisibleTexts const filter(document);
        BoxGesture const gesture(*document);
        LayersWord const word;
        if (!selection.ask()) return;
    }
    for (int index = 0; index < selection.length(); ++index) {
        EasyObject<TzDbMText> text;
        if (tzdbOpenObject(text.object, selection.at(index), TzDb::kForRead) != Tzad::eOk) continue;
        (void)text->highlight();  // the list is the same without
        listText(*text.object);
        (void)text->unhighlight();  // it ends in any case
    }
    tzDocManagerPtr()->redraw();
}

bool textFunction(resbuf const* arguments) {
    if (!arguments || arguments->restype != Tzad::eResultEntityName || arguments->rbnext)
        return false;
    TzDbObjectId id;
    EasyObject<TzDbMText> text;
    if (tzdbGetObjectId(id, arguments->resval.rlname) != Tzad::eOk ||
        tzdbOpenObject(text.object, id, TzDb::kForRead) != Tzad::eOk)
        return false;
    tzutPrintf(L"\n%ls\n", text->contents().kwszPtr());
    return true;
}

}  // namespace marks
