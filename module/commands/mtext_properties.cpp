#include "module/commands/mtext_properties.h"

#include <cmath>
#include <functional>
#include <numbers>

#include "module/commands/locked_warning_filter.h"
#include "module/commands/mtext_selection.h"
#include "module/holders/scope_guard.h"
#include "module/host_calls/selection_sets.h"
#include "module/prompt/keyword_input.h"
#include "module/styles/style_rules.h"
#include "module/texts/attachment_ids.h"
#include "module/texts/resources.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ap/document.h"
#include "tz/db/host_services.h"
#include "tz/db/mtext.h"
#include "tz/ed/print.h"
#include "tz/ed/prompt_objects.h"
#include "tz/ed/prompts.h"
#include "tz/ed/selection.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/class.h"

namespace {

constexpr double kDegrees = 180.0;

// What the questions offer: the rotation and the attachment of the first text.
struct FirstText {
    double rotation = 0;
    TzDbMText::AttachmentPoint attachment = TzDbMText::kTopLeft;
};

bool isMtext(long long const* set, int index, TzDbObjectId& id) {
    return entityAt(set, index, id) && id.objectClass()->isDerivedFrom(TzDbMText::desc());
}

bool holdsMtext(long long const* set) {
    TzDbObjectId id;
    for (int index = 0, length = lengthOf(set); index < length; ++index)
        if (isMtext(set, index, id)) return true;
    return false;
}

FirstText firstText(long long const* set) {
    for (int index = 0, length = lengthOf(set); index < length; ++index) {
        TzDbObjectId id;
        if (!isMtext(set, index, id)) continue;
        EasyObject<TzDbMText> text;
        if (tzdbOpenObject(text.object, id, TzDb::kForRead) == Tzad::eOk)
            return {text->rotation(), text->attachment()};
    }
    return {};
}

// A text that cannot be opened, or not for write, is passed over.
void changeTextPropery(long long const (&set)[2], std::function<void(TzDbMText*)> const& change) {
    for (int index = 0, length = lengthOf(set); index < length; ++index) {
        TzDbObjectId id;
        if (!entityAt(set, index, id)) continue;
        TzDbMText* text = nullptr;
        if (tzdbOpenObject(text, id, TzDb::kForRead) != Tzad::eOk) continue;
        WritableTzDbObject writable;
        if (writable.replaceObject(text)) change(text);
    }
}

void changeTextStyle(long long const (&set)[2]) {
    TzString name;
    if (tzedGetString(1, gStringTable[kText.newStylePrompt], name) != Tzad::ePromptNormal) return;
    TzDbObjectId const style = GetTextStyleID(name);
    if (style.isNull()) {
        tzutPrintf(L"%ls", gStringTable[kText.unknownStyle].kwszPtr());
        return;
    }
    changeTextPropery(set, [style](TzDbMText* text) { (void)text->setTextStyle(style); });
}

// An empty answer changes nothing: the angle that the question shows is no default, it only tells
// the rotation of the first text.
void changeTextRotate(long long const (&set)[2]) {
    int const degrees =
        static_cast<int>(std::lround(firstText(set).rotation * kDegrees / std::numbers::pi));
    TzEdPromptAngle prompt(TzString::formatted(gStringTable[kText.newRotationPrompt], degrees));
    if (prompt.getAngle() != Tzad::ePromptNormal) return;
    double const angle = prompt.value();
    changeTextPropery(set, [angle](TzDbMText* text) { (void)text->setRotation(angle); });
}

void changeTextJustify(long long const (&set)[2]) {
    CKeywordTable keywords(kAttachmentKeywords.data(),
                           static_cast<int>(kAttachmentKeywords.size()));
    CTzsKeywordInput input(0, keywords, gStringTable[kText.justificationPrompt]);
    input.SetDefault(MapAttachmentToIDS(firstText(set).attachment));
    int const status = input.Prompt();
    if (status != statusNormal && status != statusNone) return;
    unsigned int const chosen = status == statusNone ? input.GetDefault() : input.GetKeyword();
    TzDbMText::AttachmentPoint const point = MapAttachment(chosen);
    changeTextPropery(set,
                      [point](TzDbMText* text) { (void)text->setAttachmentMovingLocation(point); });
}

struct Property {
    wchar_t keyword;  // first letter of the global word
    void (*change)(long long const (&set)[2]);
};
constexpr Property kProperties[] = {
    {L'R', changeTextRotate},
    {L'S', changeTextStyle},
    {L'J', changeTextJustify},
};

// The words are the same in every language, and the text of the question shows them.
constexpr wchar_t kPropertyWords[] = L"Style Rotate Justify";

void report(FilterCount counts) {
    if (counts.locked > 0)
        TzLockedWarningFilter::sendWarning(
            getWarningId(kText.lockedLine), gStringTable[kText.lockedLine],
            gStringTable[kText.textsFound], gStringTable[kText.oneLocked],
            gStringTable[kText.manyLocked], counts);
    tzutPrintf(gStringTable[kText.textsFound], counts.found);
}

// The texts selected before the command, without those on locked layers; false when the user
// cancelled.
bool takeImplied(long long* set) {
    TzLockedWarningFilter const filter(tzDocManagerPtr()->curDocument());
    if (selectMText(set, L"_I", KindCode::result) == Tzad::ePromptCancel) return false;
    report(filter.counts());
    return true;
}

// An implied selection without a text is dropped and the user asked for another one.
bool selectTexts(long long* set) {
    if (!takeImplied(set)) return false;
    if (holdsMtext(set)) return true;
    tzedSSFree(set);
    tzedSSSetFirst(nullptr, nullptr);
    return selectMText(set, L"_:l:c:p", KindCode::result) == Tzad::ePromptNormal;
}

}  // namespace

void changeMtextProperties() {
    if (!tzdbHostApplicationServices()->workingDatabase()) return;
    long long set[2] = {};
    TzScopeGuard const freed(nullptr, [&set] { tzedSSFree(set); });
    if (!selectTexts(set)) return;

    TzEdPromptKeyword prompt;
    prompt.setMessageAndKeywords(gStringTable[kText.propertyPrompt], kPropertyWords);
    if (prompt.getKeyword() != Tzad::ePromptNormal) return;
    for (Property const& property : kProperties)
        if (*prompt.resultString().kwszPtr() == property.keyword) property.change(set);
}
