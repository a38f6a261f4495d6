#pragma once

#include "tz/db/mtext.h"

// Draws the views and the screen anew, after a text was hidden or shown.
void redrawAll();

// Hides a text while a dialog stands over it, and meanwhile leaves it open for read only, so that
// the views can be drawn. What it was is given back once, at the latest by the destructor.
//
//   HiddenText session(*text.object);
//   session.hide();
//   ... the dialog ...
//   if (!session.show()) return;  // the text could not be opened for write again
class [[nodiscard]] HiddenText {
public:
    // Takes a text that is open for write and stays open longer than this object lives.
    explicit HiddenText(TzDbMText& text) : text_(text) {}
    HiddenText(HiddenText const&) = delete;
    HiddenText& operator=(HiddenText const&) = delete;
    // Tries once more when the text is still hidden.
    ~HiddenText();

    void hide();
    // Makes the text writable, which a dialog may have ended for one that was never hidden too, and
    // a hidden one as visible as it was; false when it cannot be made writable.
    [[nodiscard]] bool show();

private:
    TzDbMText& text_;
    TzDb::Visibility before_ = TzDb::kVisible;
    bool hidden_ = false;
};
