#include "host/base/entity_drawing.h"
#include "host/database/geometry.h"
#include "host/entities/text_drawing.h"
#include "host/entities/text_imp.h"
#include "tz/db/text.h"

using tzhost::AttributeImp;
using tzhost::DefinitionImp;
using tzhost::faultStatus;
using tzhost::reshape;
using tzhost::valuesOf;

TzDbAttributeDefinition::TzDbAttributeDefinition() : TzDbText(new DefinitionImp) {}

TzDbAttributeDefinition::~TzDbAttributeDefinition() = default;

TzString TzDbAttributeDefinition::tag() const {
    return valuesOf<DefinitionImp>(*this).tag;
}

Tzad::ErrorStatus TzDbAttributeDefinition::setTag(wchar_t const* tag) {
    return reshape(*this, "TzDbAttributeDefinition::setTag", &DefinitionImp::tag,
                   std::wstring(tag ? tag : L""));
}

TzString TzDbAttributeDefinition::prompt() const {
    return valuesOf<DefinitionImp>(*this).prompt;
}

Tzad::ErrorStatus TzDbAttributeDefinition::setPrompt(wchar_t const* prompt) {
    return tzhost::assign(*this, "TzDbAttributeDefinition::setPrompt", &DefinitionImp::prompt,
                          std::wstring(prompt ? prompt : L""));
}

bool TzDbAttributeDefinition::isMTextAttributeDefinition() const {
    return valuesOf<DefinitionImp>(*this).lines != nullptr;
}

TzDbMText const* TzDbAttributeDefinition::getMTextAttributeDefinitionConst() const {
    return valuesOf<DefinitionImp>(*this).lines.get();
}

TzDbMText* TzDbAttributeDefinition::getMTextAttributeDefinition() {
    return valuesOf<DefinitionImp>(*this).lines.get();
}

Tzad::ErrorStatus TzDbAttributeDefinition::setMTextAttributeDefinition(TzDbMText* text) {
    if (auto const fault = faultStatus("TzDbAttributeDefinition::setMTextAttributeDefinition")) {
        return fault;
    }
    DefinitionImp& values = valuesOf<DefinitionImp>(*this);
    bool const isOwn = text && text == values.lines.get();
    if (text && !text->objectId().isNull()) return Tzad::eAlreadyInDatabase;
    if (text && !isOwn && TzDbObjectAccess::imp(*text)->embedder) return Tzad::eInvalidInput;
    if (auto const status = tzhost::beginChange(*this)) return status;
    if (!isOwn) values.lines.reset(text);
    values.settle(*this);
    return Tzad::eOk;
}

bool TzDbAttributeDefinition::subWorldDraw(TzGiWorldDraw* draw) {
    if (!draw || tzhost::takenWhole(draw, *this, L"ATTDEF", position())) return true;
    DefinitionImp const& values = valuesOf<DefinitionImp>(*this);
    if (values.lines) return values.lines->worldDraw(draw);
    tzhost::TextFrame const frame{
        values.position(), tzhost::directionAt(values.normal, values.rotation), values.normal};
    tzhost::drawRuns(*draw, frame, values.layout().runs);
    return true;
}

Tzad::ErrorStatus TzDbAttributeDefinition::subTransformBy(TzGeMatrix3d const& matrix) {
    if (auto const status = TzDbText::subTransformBy(matrix)) return status;
    DefinitionImp& values = valuesOf<DefinitionImp>(*this);
    return values.lines ? values.lines->transformBy(matrix) : Tzad::eOk;
}

TzDbAttribute::TzDbAttribute() : TzDbText(new AttributeImp) {}

TzDbAttribute::~TzDbAttribute() = default;

TzString TzDbAttribute::tag() const {
    return valuesOf<AttributeImp>(*this).tag;
}

Tzad::ErrorStatus TzDbAttribute::setTag(wchar_t const* tag) {
    return tzhost::assign(*this, "TzDbAttribute::setTag", &AttributeImp::tag,
                          std::wstring(tag ? tag : L""));
}
