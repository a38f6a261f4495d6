#include "module/edit/session_field.h"

#include <utility>

#include "tz/db/field.h"

SessionField::~SessionField() {
    delete std::exchange(text_.field, nullptr);
}

void SessionField::attachTo(TzDbMText& owner) {
    if (!text_.field) return;
    TzDbObjectId dropped;
    // A refused field stays in the holder, for the destructor.
    if (owner.setField(kTextFieldKey, text_.field, dropped) != Tzad::eOk) return;
    (void)std::exchange(text_.field, nullptr)->close();  // the drawing's now; closes in any case
}
