#include "module/edit/hidden_text.h"

#include "tz/ap/document.h"
#include "tz/ed/editors.h"

void redrawAll() {
    tzDocManagerPtr()->redraw();
    tzedUpdateDisplay();
}

HiddenText::~HiddenText() {
    (void)show();  // nothing is left to do for a text that still cannot be opened
}

void HiddenText::hide(EasyObject<TzDbMText>& text) {
    before_ = text->visibility();
    text_ = text.object;
    (void)text_->setVisibility(TzDb::kInvisible);  // a text that stays visible is no harm
    (void)text_->downgradeOpen();                  // one that is in no drawing stays writable
    redrawAll();
}

bool HiddenText::show() {
    if (!text_) return true;
    if (!text_->isWriteEnabled() && text_->upgradeOpen() != Tzad::eOk) return false;
    (void)text_->setVisibility(before_);  // writable, so that it takes what it had
    text_ = nullptr;
    return true;
}
