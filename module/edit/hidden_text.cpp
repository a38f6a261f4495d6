#include "module/edit/hidden_text.h"

#include "tz/ap/document.h"
#include "tz/ed/editors.h"

void redrawAll() {
    tzDocManagerPtr()->redraw();
    tzedUpdateDisplay();
}

HiddenText::~HiddenText() {
    if (hidden_) (void)show();  // nothing is left to do for a text that still cannot be opened
}

void HiddenText::hide() {
    before_ = text_.visibility();
    (void)text_.setVisibility(TzDb::kInvisible);  // a text that stays visible is no harm
    hidden_ = true;
    (void)text_.downgradeOpen();  // one that is in no drawing stays writable
    redrawAll();
}

// A text that is as visible as it was is not set: the change would be its first in this command and
// take memory, which a destructor must not ask for.
bool HiddenText::show() {
    if (!text_.isWriteEnabled() && text_.upgradeOpen() != Tzad::eOk) return false;
    if (hidden_ && text_.visibility() != before_)
        (void)text_.setVisibility(before_);  // writable, so that it takes what it had
    hidden_ = false;
    return true;
}
