#include "tz/db/field.h"

#include <algorithm>
#include <cwchar>
#include <new>

#include "host/database/drawing.h"
#include "host/database/exact_values.h"
#include "host/fields/field_codes.h"
#include "host/fields/field_imp.h"
#include "host/fields/field_links.h"
#include "host/platform/output.h"
#include "host/runtime/notification.h"
#include "host/text/local_text.h"
#include "tz/db/mtext.h"
#include "tz/gi/draw.h"

using tzhost::faultStatus;
using tzhost::FieldImp;
using tzhost::valuesOf;

namespace tzhost {
namespace {

// Takes the link to a field out of the object that has it.
void unlink(TzDbObject& owner, TzDbObjectRecord const* field) {
    auto& fields = TzDbObjectAccess::imp(owner)->fields;
    if (!fields) return;
    beginHostChange(owner);
    std::erase_if(*fields, [=](auto const& link) { return link.second.record() == field; });
    if (fields->empty()) fields.reset();
}

void sayTooLong() {
    TzString const line =
        TzString::formatted(localText(L"\nFields of one text show %d letters at most; the longer "
                                      L"value is shown as ####."),
                            static_cast<int>(kMostFieldLetters));
    print(line.str());
}

}  // namespace

std::unique_ptr<TzDbObjectImp> FieldImp::copy() const {
    return std::make_unique<FieldImp>(*this);
}

bool FieldImp::isSameAs(TzDbObjectImp const& other) const {
    return TzDbObjectImp::isSameAs(other) &&
           agree(*this, static_cast<FieldImp const&>(other), &FieldImp::code, &FieldImp::shown,
                 &FieldImp::evaluated);
}

// The object keeps the text that the field showed last.
void FieldImp::onErase(bool erasing) {
    if (erasing && record && record->owner) unlink(*record->owner->object, record);
}

void renewTextField(TzDbMText& text) try {
    TzDbObjectImp& imp = *TzDbObjectAccess::imp(text);
    if (!imp.record) return;
    if (imp.fields) {
        for (auto const& [key, id] : *imp.fields) {
            beginHostChange(*id.record()->object);
            id.record()->erased = true;
        }
        imp.fields.reset();
    }
    std::wstring const contents = text.contents().str();
    if (!findField(contents, 0)) return;
    auto field = std::make_unique<TzDbField>();
    TzDbObjectId id;
    if (field->setFieldCode(contents.c_str(), 0, nullptr) != Tzad::eOk) return;
    if (text.setField(L"TEXT", field.get(), id) != Tzad::eOk) return;
    (void)field.release()->close();  // closes in any case
} catch (std::bad_alloc const&) {
    // The text itself is set; a field that could not be made is one that could not be attached.
}

}  // namespace tzhost

TzDbField::TzDbField() : TzDbObject(new FieldImp) {}

TzDbField::~TzDbField() = default;

Tzad::ErrorStatus TzDbField::setFieldCode(wchar_t const* code,
                                          int /*flags*/,
                                          TzArray<TzDbField*> const* /*children*/) {
    if (auto const fault = faultStatus("TzDbField::setFieldCode")) return fault;
    std::wstring next(code ? code : L"");
    if (auto const status = tzhost::beginChange(*this)) return status;
    FieldImp& values = valuesOf<FieldImp>(*this);
    values.code = std::move(next);
    values.evaluated = false;
    return Tzad::eOk;
}

TzString TzDbField::getFieldCode(int flags) const {
    constexpr int kEvaluated = 2;
    FieldImp const& values = valuesOf<FieldImp>(*this);
    return (flags & kEvaluated) && values.evaluated ? values.shown : values.code;
}

Tzad::ErrorStatus TzDbField::evaluate(int context, TzDbDatabase* database) {
    if (auto const fault = faultStatus("TzDbField::evaluate", Tzad::eFieldNotEvaluated)) {
        return fault;
    }
    constexpr int kOnDemand = 0x20;
    if (!(context & kOnDemand)) return Tzad::eNotApplicable;
    FieldImp& values = valuesOf<FieldImp>(*this);
    auto expanded = tzhost::expandFields(values.code, tzhost::drawingOf(database));
    if (auto const status = tzhost::beginChange(*this)) return status;
    if (expanded.tooLong) tzhost::sayTooLong();
    values.shown = std::move(expanded.text);
    values.evaluated = true;
    if (TzDbObjectRecord const* const record = objectId().record(); record && record->owner) {
        TzDbObject& owner = *record->owner->object;
        tzhost::beginHostChange(owner);
        TzDbObjectAccess::imp(owner)->showFieldText(values.shown);
    }
    return expanded.complete ? Tzad::eOk : Tzad::eFieldNotEvaluated;
}

bool TzDbField::subWorldDraw(TzGiWorldDraw* /*draw*/) {
    return true;
}

void TzDbField::subViewportDraw(TzGiViewportDraw* /*draw*/) {}

unsigned int TzDbField::subSetAttributes(TzGiDrawableTraits* /*traits*/) {
    return 0;
}

bool tzdbHasFields(wchar_t const* text, int /*options*/) {
    return text && tzhost::findField(text).has_value();
}

bool tzdbFindField(wchar_t const* text, int start, int& first, int& end) {
    auto const from = static_cast<std::size_t>(std::max(start, 0));
    if (!text || ::wcsnlen(text, from) < from) return false;
    auto const span = tzhost::findField(text + from);
    if (!span) return false;
    first = static_cast<int>(from + span->first);
    end = static_cast<int>(from + span->end);
    return true;
}

void tzedTextFieldModified(TzDbField* field) {
    if (!field) return;
    tzhost::reportNotification("textFieldModified");
}
