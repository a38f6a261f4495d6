#include <cstring>
#include <iterator>

#include "host/database/classes.h"
#include "host/database/drawing.h"
#include "host/database/symbol_imp.h"
#include "host/entities/style_look.h"
#include "host/entities/text_imp.h"
#include "host/layout/line_layout.h"
#include "tz/db/text.h"
#include "tz/rx/resbuf.h"

// The data of entities as lists, and the text box that is measured from them.
namespace {

// Codes of the list's records.
enum Code : int {
    kName = -1,
    kKind = 0,
    kText = 1,
    kStyle = 7,
    kLayer = 8,
    kPosition = 10,
    kHeight = 40,
    kWidthFactor = 41,
    kRotation = 50,
    kOblique = 51,
    kNormal = 210,
};

// Builds a list from the front; releases it when memory fails on the way.
class ListBuilder {
public:
    ListBuilder() = default;
    ListBuilder(ListBuilder const&) = delete;
    ListBuilder& operator=(ListBuilder const&) = delete;
    ~ListBuilder() { tzutRelRb(first_); }

    void name(TzDbObjectId id) { (void)tzdbGetTzsName(add(kName).rlname, id); }
    void string(int code, wchar_t const* text) { add(code).rstring = tzutNewString(text); }
    void real(int code, double value) { add(code).rreal = value; }
    void triple(int code, double x, double y, double z) {
        resval_u& value = add(code);
        value.rpoint[0] = x;
        value.rpoint[1] = y;
        value.rpoint[2] = z;
    }
    [[nodiscard]] resbuf* take() { return std::exchange(first_, nullptr); }

private:
    resval_u& add(int code) {
        *end_ = new resbuf{};
        (*end_)->restype = static_cast<short>(code);
        resval_u& value = (*end_)->resval;
        end_ = &(*end_)->rbnext;
        return value;
    }

    resbuf* first_ = nullptr;
    resbuf** end_ = &first_;
};

std::wstring styleName(TzDbObjectId style) {
    return style.isNull() ? std::wstring()
                          : tzhost::valuesOf<tzhost::SymbolImp>(*style.record()->object).name;
}

void addText(ListBuilder& list, TzDbText const& text) {
    tzhost::TextImp const& values = tzhost::valuesOf<tzhost::TextImp>(text);
    list.string(kText, values.shownText().c_str());
    list.string(kStyle, styleName(values.style).c_str());
    TzGePoint3d const position = values.position();
    list.triple(kPosition, position.x, position.y, position.z);
    list.real(kHeight, values.height);
    list.real(kWidthFactor, values.widthFactor);
    list.real(kRotation, values.rotation);
    list.real(kOblique, values.oblique);
    list.triple(kNormal, values.normal.x, values.normal.y, values.normal.z);
}

resbuf const* findRecord(resbuf const* list, int code) {
    for (; list; list = list->rbnext) {
        if (list->restype == code) return list;
    }
    return nullptr;
}

double realIn(resbuf const* list, int code, double fallback) {
    resbuf const* const record = findRecord(list, code);
    return record ? record->resval.rreal : fallback;
}

bool isTextKind(wchar_t const* kind) {
    TzString const text(kind);
    return text == L"TEXT" || text == L"ATTDEF" || text == L"ATTRIB";
}

// The box of a definition with lines, which a list does not hold; null for every other entity.
tzhost::DefinitionImp const* linesIn(resbuf const* list) {
    resbuf const* const name = findRecord(list, kName);
    TzDbObjectId id;
    if (!name || tzdbGetObjectId(id, name->resval.rlname) != Tzad::eOk) return nullptr;
    if (id.objectClass() != TzDbAttributeDefinition::desc()) return nullptr;
    auto const& values = tzhost::valuesOf<tzhost::DefinitionImp>(*id.record()->object);
    return values.lines ? &values : nullptr;
}

tzhost::LayoutBox measure(resbuf const* list) {
    if (auto const* const definition = linesIn(list)) return definition->box();
    tzhost::LineLayoutInput input;
    resbuf const* const text = findRecord(list, kText);
    if (text && text->resval.rstring) input.text = tzhost::decodeLineText(text->resval.rstring);
    input.textHeight = realIn(list, kHeight, input.textHeight);
    TzDbObjectId style;
    resbuf const* const name = findRecord(list, kStyle);
    if (tzhost::Drawing const* const drawing = tzhost::workingDrawing(); drawing && name) {
        style = tzhost::Drawing::find(drawing->textStyleTableId(), name->resval.rstring);
    }
    input.style = tzhost::lookOfStyle(style);
    input.style.widthFactor = realIn(list, kWidthFactor, input.style.widthFactor);
    input.style.oblique = realIn(list, kOblique, input.style.oblique);
    return tzhost::layOutLine(input).box;
}

}  // namespace

resbuf* tzdbEntGet(long long const* name) {
    if (tzhost::faultStatus("tzdbEntGet")) return nullptr;
    TzDbObjectId id;
    if (tzdbGetObjectId(id, name) != Tzad::eOk || id.isErased()) return nullptr;
    auto const* const entity = tzrxCast<TzDbEntity>(id.record()->object);
    if (!entity) return nullptr;
    ListBuilder list;
    list.string(kKind, tzhost::entityKind(entity->isA()).kwszPtr());
    list.name(id);
    list.string(kLayer, entity->layer().kwszPtr());
    if (auto const* const text = tzrxCast<TzDbText>(entity)) addText(list, *text);
    return list.take();
}

int tzedTextBox(resbuf const* data, double* lowerLeft, double* upperRight) {
    if (auto const fault = tzhost::faultStatus("tzedTextBox", Tzad::ErrorStatus{-5001})) {
        return fault;
    }
    resbuf const* const kind = findRecord(data, kKind);
    if (!kind || !lowerLeft || !upperRight || !isTextKind(kind->resval.rstring)) {
        return Tzad::ePromptError;
    }
    tzhost::LayoutBox const box = measure(data);
    double const low[] = {box.left, box.bottom, 0.0};
    double const high[] = {box.right, box.top, 0.0};
    std::copy(std::begin(low), std::end(low), lowerLeft);
    std::copy(std::begin(high), std::end(high), upperRight);
    return Tzad::ePromptNormal;
}
