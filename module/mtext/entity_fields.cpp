#include "module/mtext/entity_fields.h"

#include <memory>

#include "tz/db/field.h"
#include "tz/db/host_services.h"
#include "tz/db/mtext.h"
#include "tz/mte/easy_object.h"

namespace {

constexpr int kEveryKind = 0x20;
constexpr int kEvaluatedText = 2;

Tzad::ErrorStatus evaluate(TzDbField& field) {
    return field.evaluate(kEveryKind, tzdbHostApplicationServices()->workingDatabase());
}

}  // namespace

TzString withFieldsEvaluated(TzString const& text) {
    if (!tzdbHasFields(text, 1)) return text;
    auto const field = std::make_unique<TzDbField>();
    (void)field->setFieldCode(text, 0, nullptr);  // if refused, the field has no value
    TzString const result =
        evaluate(*field) == Tzad::eOk ? field->getFieldCode(kEvaluatedText) : text;
    (void)field->close();
    return result;
}

void attachField(TzDbObjectId text, SessionField& field) {
    EasyObject<TzDbMText> opened;
    if (tzdbOpenObject(opened.object, text, TzDb::kForWrite) != Tzad::eOk) return;
    field.attachTo(*opened.object);
}

void evaluateField(TzDbObjectId text) {
    EasyObject<TzDbMText> opened;
    if (tzdbOpenObject(opened.object, text, TzDb::kForRead) != Tzad::eOk) return;
    EasyObject<TzDbField> field;
    if (opened->getField(kTextFieldKey, field.object, TzDb::kForWrite) != Tzad::eOk) return;
    (void)evaluate(*field.object);  // a field that fails shows "####"
}
