#pragma once

#include "tz/db/mtext.h"
#include "tz/mte/easy_object.h"

// The field that an editor session leaves in the holder of a text that is in no drawing. Whoever
// runs the session makes one of these before it, so that a field is never lost.
//
//   EasyObject<TzDbMText> held(text, EasyFlags::kNone);
//   SessionField field(held);
//   if (InvokeEditorOn(held, ...) == kEditorAccepted) field.attachTo(*text);

// The key under which a text has its field.
inline constexpr wchar_t const* kTextFieldKey = L"TEXT";

class [[nodiscard]] SessionField {
public:
    // The holder outlives this object; its text may be taken out meanwhile.
    explicit SessionField(EasyObject<TzDbMText>& text) : text_(text) {}
    SessionField(SessionField const&) = delete;
    SessionField& operator=(SessionField const&) = delete;
    // Deletes a field that is still there.
    ~SessionField();

    [[nodiscard]] bool isLeft() const { return text_.field != nullptr; }
    // Hands the field over to a text that is open for write; without a field nothing happens. One
    // that the text refuses stays for the destructor.
    void attachTo(TzDbMText& owner);

private:
    EasyObject<TzDbMText>& text_;
};
