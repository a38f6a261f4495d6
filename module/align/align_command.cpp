#include "module/align/align_command.h"

#include "module/align/align_jig.h"
#include "module/align/selection_keywords.h"
#include "module/align/setting_texts.h"
#include "module/align/spacing/current_spacing.h"
#include "module/align/spacing/even_spacing.h"
#include "module/align/text_filter.h"
#include "module/geometry/points.h"
#include "module/holders/scope_guard.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ap/document.h"
#include "tz/ed/print.h"
#include "tz/ed/prompts.h"
#include "tz/ed/selection.h"
#include "tz/ed/ucs.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/resbuf.h"

namespace {

// Bits of tzedInitGet. The one for negative values says nothing of a keyword; it is handed over all
// the same, and an empty answer is taken.
constexpr int kNoEmptyAnswer = 1;
constexpr int kNoNegative = 4;

constexpr int kLongestKeyword = 255;  // letters

// The keywords of a selection go to the alignment while this lives.
class [[nodiscard]] SelectionKeywords {
public:
    explicit SelectionKeywords(TzMTextAlignCmd* command) {
        // When there was no earlier callback, none is put back.
        (void)tzedSSGetKwordCallbackPtr(&before_);
        TzMTextAlignSSCallbackHandler::m_command = command;
        tzedSSSetKwordCallbackPtr(TzMTextAlignSSCallbackHandler::keywordCallback);
    }
    SelectionKeywords(SelectionKeywords const&) = delete;
    SelectionKeywords& operator=(SelectionKeywords const&) = delete;
    ~SelectionKeywords() { tzedSSSetKwordCallbackPtr(before_); }

private:
    TzedSSKeywordCallback before_ = nullptr;
};

// Each text that can be opened is highlighted, or shown as before.
template <class Show>
void showEach(TzArray<TzDbObjectId> const& ids, Show const& show) {
    for (TzDbObjectId const& id : ids) {
        EasyObject<TzDbEntity> entity;
        if (tzdbOpenObject(entity.object, id, TzDb::kForRead) == Tzad::eOk) show(*entity.object);
    }
}

// A keyword has one letter at least and 255 at most, as in a buffer with its closing zero.
int askKeyword(TzString const& prompt, unsigned int keywords, TzString& answer) {
    tzedInitGet(kNoNegative, gStringTable[keywords]);
    int const status = tzedGetKword(prompt, answer);
    if (status != Tzad::ePromptNormal) return status;
    if (answer.isEmpty()) return Tzad::ePromptError;
    return answer.length() > kLongestKeyword ? Tzad::ePromptTooLong : status;
}

}  // namespace

TzMTextAlignCmd::TzMTextAlignCmd() : m_manipulator(std::make_unique<TzMTextAlignManipulator>()) {
    m_manipulator->registerAlignOption(new TzMTextAlignOptionDistribute);
    m_manipulator->registerAlignOption(new TzMTextAlignOptionCurrentSpaceHorizontal);
    m_manipulator->registerAlignOption(new TzMTextAlignOptionCurrentSpaceVertical);
    m_manipulator->registerAlignOption(new TzMTextAlignOptionSpecificSpace);
}

TzMTextAlignCmd::~TzMTextAlignCmd() {
    if (m_ucsChanged) tzedRestorePreviousUCS();
    showEach(m_manipulator->texts(), [](TzDbEntity& entity) { (void)entity.unhighlight(); });
}

void TzMTextAlignCmd::run() {
    m_manipulator->loadDefaultSettings();
    reportCurrentSettings();
    if (!selectTextEntity()) return;
    m_manipulator->addText();
    setUserSystem();
    if (!acquireFirstPoint()) return;
    if (!dragToAlign()) return;
    m_manipulator->updateDb();
    m_manipulator->saveAsDefaultSettings();
}

bool TzMTextAlignCmd::acquireTextObjsAndAlignSettings() {
    bool const isSelected = selectTextEntity();
    if (isSelected) m_manipulator->addText();
    return isSelected;
}

// When the host refuses the system, the points are taken in the system that was in force.
void TzMTextAlignCmd::setUserSystem() {
    m_ucsChanged = tzedSetCurrentUCS(m_manipulator->coorSystemForWorkingPlane()) == Tzad::eOk;
}

bool TzMTextAlignCmd::selectTextEntity() {
    TzString const prompt = gStringTable[kText.alignSelection];
    wchar_t const* const prompts[] = {prompt.kwszPtr(), L""};
    TzEdTextSSFilter const filter(tzDocManagerPtr()->curDocument(), *m_manipulator);
    TzString const words = gStringTable[kText.alignSelectionKeywords];
    tzedInitGet(kNoEmptyAnswer, words);
    SelectionKeywords const keywords(this);
    long long selection[2] = {};
    int const status = tzedSSGet(L"_:L:K:$", prompts, words.kwszPtr(), nullptr, selection);
    if (status == Tzad::ePromptNormal) takeSelection(selection);
    return status == Tzad::ePromptNormal;
}

void TzMTextAlignCmd::takeSelection(long long const* selection) {
    TzScopeGuard const freed(nullptr, [selection] { tzedSSFree(selection); });
    (void)m_manipulator->insertTexts(selection);
    reportNonCoplanarEntities(selection);
    showEach(m_manipulator->texts(), [](TzDbEntity& entity) { (void)entity.highlight(); });
}

bool TzMTextAlignCmd::acquireFirstPoint() {
    TzString const prompt = gStringTable[kText.alignTarget];
    TzEdTextSSFilter const filter(tzDocManagerPtr()->curDocument(), *m_manipulator);
    TzString const keywords = gStringTable[kText.alignTargetKeywords];
    for (;;) {
        tzedInitGet(kNoEmptyAnswer, keywords);
        long long name[2] = {};
        double point[3] = {};
        double matrix[4][4] = {};
        resbuf* references = nullptr;
        int const status = tzedNEntSelP(prompt, name, point, 0, matrix, &references);
        tzutRelRb(references);
        if (status == Tzad::ePromptCancel) return false;
        if (status == Tzad::ePromptKeyword) return pickFirstPoint();
        if (status == Tzad::ePromptNormal && targetTextReferencePoint(name)) return true;
    }
}

bool TzMTextAlignCmd::targetTextReferencePoint(long long const* name) {
    TzDbObjectId id;
    if (tzdbGetObjectId(id, name) != Tzad::eOk || !m_manipulator->isTextSupported(id)) return false;
    m_manipulator->setTargetText(id);
    return true;
}

bool TzMTextAlignCmd::pickFirstPoint() {
    double point[3] = {};
    if (tzedGetPoint(nullptr, gStringTable[kText.alignFirstPoint], point) != Tzad::ePromptNormal)
        return false;
    tzdbUcs2Wcs(point, point, false);  // one that cannot be converted is taken as it is
    m_firstPoint = pointOf(point);
    m_manipulator->setFirstPoint(m_firstPoint);
    return true;
}

bool TzMTextAlignCmd::dragToAlign() {
    m_manipulator->prepareForDragging();
    TzMTextAlignJig jig(*m_manipulator);
    reportCurrentOption();
    for (;;) {
        jig.preparePrompt();
        TzEdJig::DragStatus const status = jig.drag();
        if (status == TzEdJig::kNormal) return true;
        if (status == TzEdJig::kCancel) return false;
        if (!isSettingOption(status)) continue;
        if (acquireAlignOption() == Tzad::ePromptCancel) return false;
        reportCurrentOption();
    }
}

bool TzMTextAlignCmd::isSettingOption(TzEdJig::DragStatus status) {
    return status == TzEdJig::kKW1;
}

int TzMTextAlignCmd::acquireAlignOption() {
    TzString const current = descriptionOfOption(m_manipulator->alignOption()->name());
    TzString answer;
    int const status =
        askKeyword(TzString::formatted(gStringTable[kText.spacingPrompt], current.kwszPtr()),
                   kText.spacingKeywords, answer);
    // The option is in force also when the question that it asks is cancelled.
    if (status == Tzad::ePromptNormal) (void)m_manipulator->setAlignOption(optionNameOf(answer));
    return status;
}

int TzMTextAlignCmd::acquireAlignDirection() {
    TzString const current = descriptionOf(m_manipulator->alignDirection());
    TzString answer;
    int const status =
        askKeyword(TzString::formatted(gStringTable[kText.alignmentPrompt], current.kwszPtr()),
                   kText.alignmentKeywords, answer);
    if (status != Tzad::ePromptNormal) return status;
    tagTextDirection const chosen = directionOf(answer);
    if (chosen == m_manipulator->alignDirection()) return Tzad::ePromptCancel;
    m_manipulator->setAlignDirection(chosen);
    return Tzad::ePromptNormal;
}

void TzMTextAlignCmd::reportCurrentSettings() const {
    tzutPrintf(gStringTable[kText.alignSettings],
               descriptionOf(m_manipulator->alignDirection()).kwszPtr(),
               m_manipulator->alignOption()->description().kwszPtr());
}

void TzMTextAlignCmd::reportCurrentOption() const {
    tzutPrintf(gStringTable[kText.alignSpacing],
               m_manipulator->alignOption()->description().kwszPtr());
}

void TzMTextAlignCmd::reportNonCoplanarEntities(long long const* selection) const {
    int length = 0;
    if (tzedSSLength(selection, &length) != Tzad::ePromptNormal) return;
    int const leftOut = length - m_manipulator->texts().length();
    if (leftOut > 0) tzutPrintf(gStringTable[kText.alignLeftOut], leftOut);
}
