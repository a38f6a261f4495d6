#include "host/database/extensions.h"

#include "host/database/entity_imp.h"
#include "host/database/symbol_imp.h"
#include "tz/db/extensions.h"
#include "tz/db/mtext.h"
#include "tz/db/text.h"
#include "tz/rx/class.h"

namespace tzhost {
namespace {

bool isText(TzDbObject const* object) {
    return tzrxCast<TzDbMText>(object) || tzrxCast<TzDbText>(object);
}

// Reads a mark that both texts and text styles have; false for anything else.
bool readMark(TzDbObject const* object, bool TextStyledImp::*ofText, bool TextStyleImp::*ofStyle) {
    if (isText(object)) return valuesOf<TextStyledImp>(*object).*ofText;
    if (tzrxCast<TzDbTextStyleTableRecord>(object)) return valuesOf<TextStyleImp>(*object).*ofStyle;
    return false;
}

Tzad::ErrorStatus writeMark(TzDbObject* object,
                            char const* operation,
                            bool TextStyledImp::*ofText,
                            bool TextStyleImp::*ofStyle,
                            bool mark) {
    if (!object) return Tzad::eNullObjectPointer;
    if (isText(object)) return assign(*object, operation, ofText, mark);
    if (tzrxCast<TzDbTextStyleTableRecord>(object)) {
        return assign(*object, operation, ofStyle, mark);
    }
    return Tzad::eWrongObjectType;
}

class Annotative final : public TzDbAnnotativeObjectPE {
public:
    bool annotative(TzDbObject const* object) override {
        return readMark(object, &TextStyledImp::annotative, &TextStyleImp::annotative);
    }
    Tzad::ErrorStatus setAnnotative(TzDbObject* object, bool mark) override {
        return writeMark(object, "TzDbAnnotativeObjectPE::setAnnotative",
                         &TextStyledImp::annotative, &TextStyleImp::annotative, mark);
    }
    // Sizes are not kept per scale here, so they are always up to date.
    Tzad::ErrorStatus updateScale(TzDbObject* object, bool& changed) override {
        changed = false;
        if (auto const fault = faultStatus("TzDbAnnotativeObjectPE::updateScale")) return fault;
        return object ? Tzad::eOk : Tzad::eNullObjectPointer;
    }
};

class PaperOrientation final : public TzDbPaperOrientationPE {
public:
    bool paperOrientation(TzDbObject const* object) override {
        return readMark(object, &TextStyledImp::paperOrientation, &TextStyleImp::paperOrientation);
    }
    Tzad::ErrorStatus setPaperOrientation(TzDbObject* object, bool mark) override {
        return writeMark(object, "TzDbPaperOrientationPE::setPaperOrientation",
                         &TextStyledImp::paperOrientation, &TextStyleImp::paperOrientation, mark);
    }
};

}  // namespace

void addDatabaseExtensions() {
    static Annotative annotative;
    static PaperOrientation orientation;
    for (TzRxClass* const each :
         {TzDbMText::desc(), TzDbText::desc(), TzDbTextStyleTableRecord::desc()}) {
        each->addX(TzDbAnnotativeObjectPE::desc(), &annotative);
        each->addX(TzDbPaperOrientationPE::desc(), &orientation);
    }
}

}  // namespace tzhost
