#pragma once

#include "tz/db/mtext.h"
#include "tz/mte/easy_object.h"

// Draws the views and the screen anew, after a text was hidden or shown.
void redrawAll();

// Hides a text while a dialog stands over it, and meanwhile leaves it open for read only, so that
// the views can be drawn. What it was is given back once, at the latest by the destructor.
//
//   HiddenText hidden;
//   hidden.hide(text);
//   ... the dialog ...
//   if (!hidden.show()) return;  // the text could not be opened for write again
class [[nodiscard]] HiddenText {
public:
    HiddenText() = default;
    HiddenText(HiddenText const&) = delete;
    HiddenText& operator=(HiddenText const&) = delete;
    // Tries once more when the text is still hidden.
    ~HiddenText();

    // Takes a text that is open for write; its holder outlives this object.
    void hide(EasyObject<TzDbMText>& text);
    // Makes the text writable and as visible as it was; false when it cannot be made writable.
    // True when nothing is hidden.
    [[nodiscard]] bool show();

private:
    TzDbMText* text_ = nullptr;
    TzDb::Visibility before_ = TzDb::kVisible;
};
