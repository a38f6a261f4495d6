// MARKNOTE: writes notes through what the text module offers to other modules: its command object,
// its entry points for attributes, and its editors.

#include <array>
#include <memory>

#include "bodies.h"
#include "posting.h"
#include "tz/db/mtext.h"
#include "tz/db/text.h"
#include "tz/ed/print.h"
#include "tz/ed/prompts.h"
#include "tz/ed/selection.h"
#include "tz/ed/ucs.h"
#include "tz/mte/dialog_params.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"
#include "tz/rx/status.h"

namespace marks {
namespace {

constexpr int kAccepted = 1;

void report(wchar_t const* what, int result) {
    tzutPrintf(L"\n%ls: %d\n", what, result);
}

void report(wchar_t const* what, int result, TzDbMText const& text) {
    tzutPrintf(L"\n%ls: %d at %ls, width %.4f: %ls\n", what, result,
               inUserUnits(text.location()).kwszPtr(), text.width(), text.contents().kwszPtr());
}

// A text that belongs to no drawing, at a place that the user gives or else at the origin.
std::unique_ptr<TzDbMText> askLooseText() {
    double user[3]{};
    int const status = tzedGetPoint(nullptr, L"\nPlace of the text <origin>: ", user);
    if (status != Tzad::ePromptNormal && status != Tzad::ePromptNone) return nullptr;
    auto text = std::make_unique<TzDbMText>();
    text->setDatabaseDefaults();
    if (status == Tzad::ePromptNormal) {
        double world[3]{};
        if (!tzdbUcs2Wcs(user, world, false)) return nullptr;
        (void)text->setLocation({world[0], world[1], world[2]});
    }
    // The values are within what a text takes.
    (void)text->setWidth(20);
    (void)text->setContents(L"NOTE");
    return text;
}

// The text of an attribute as a dialog edits it; accepted, it becomes a note of the drawing.
void writeAttribute() {
    std::unique_ptr<TzDbMText> text = askLooseText();
    if (!text) return;
    int const result = doMTextCommandForAttributeDlg(text.get());
    report(L"Attribute", result, *text);
    if (result == kAccepted) (void)post(text.release());  // a drawing that takes no note has none
}

void writeDefinition() {
    std::unique_ptr<TzDbMText> text = askLooseText();
    if (!text) return;
    int const result = doMTextCommandForAttDefCmd(text.get());
    report(L"Definition", result, *text);
    if (result != kAccepted) return;
    auto* const definition = new TzDbAttributeDefinition;
    definition->setDatabaseDefaults();
    // A tag of letters and a place that a text has already.
    (void)definition->setTag(L"NOTE");
    (void)definition->setPosition(text->location());
    if (definition->setMTextAttributeDefinition(text.get()) == Tzad::eOk) (void)text.release();
    (void)post(definition);  // a drawing that takes no definition has none
}

// The entry points take a null text as a cancel.
void writeNothing() {
    report(L"Attribute", doMTextCommandForAttributeDlg(nullptr));
    report(L"Definition", doMTextCommandForAttDefCmd(nullptr));
    report(L"Entity", TzadEditMTextEntity(nullptr, kMTETabText, nullptr, 0, 0, true, true));
}

TzDbObjectId pick() {
    long long name[2]{};
    double point[3]{};
    TzDbObjectId id;
    if (tzedEntSel(L"\nText to edit: ", name, point) == Tzad::ePromptNormal &&
        tzdbGetObjectId(id, name) != Tzad::eOk)
        id.setNull();
    return id;
}

void editHeldText() {
    EasyObject<TzDbMText> text;
    if (tzdbOpenObject(text.object, pick(), TzDb::kForWrite) != Tzad::eOk) return;
    report(L"Entity", TzadEditMTextEntity(nullptr, kMTETabText, text.object, 0, 0, true, true));
}

void editById() {
    TzDbObjectId const id = pick();
    if (id.isNull()) return;
    report(L"Editor", InvokeEditorOn(id, kMTETabText, 0, true, true));
    tzutPrintf(L"\nIn place: %ls\n", gbUsedIPE ? L"yes" : L"no");
}

// The first text of a selection, then the same one by its older name.
void editSelected() {
    long long set[2]{};
    if (tzedSSGet(nullptr, nullptr, nullptr, nullptr, set) != Tzad::ePromptNormal) return;
    report(L"Selected", EditMtextInSelectionSet(set, kMTETabText, true, true));
    long long name[2]{};
    if (tzedSSName(set, 0, name) == Tzad::ePromptNormal)
        report(L"Named", EditMtextByAdsName(name, kMTETabText, true, true));
    tzedSSFree(set);
}

// The plain markup, in the raw editor.
void editMarkup() {
    EasyObject<TzDbMText> text;
    if (tzdbOpenObject(text.object, pick(), TzDb::kForWrite) != Tzad::eOk) return;
    TzApHostRawEditorParamsFrameless params;
    params.setEasyMText(&text);
    TzApHostDialogRawEditor::instance().doModal(params);
    report(L"Markup", params.returnCode());
}

// A new note at a fixed place, its text from the command line.
void writeNew() {
    std::unique_ptr<TzxMtextCommand> const command(newTzxMtextCommand());
    constexpr unsigned kTopLeft = 1048;
    command->setInitialProperties({5, 5, 0}, 30, 0, command->getTextHeight(), kTopLeft,
                                  command->styleName);
    command->UseCommandLineEditor(true);
    report(L"New", command->CreateObject(nullptr, false));
}

struct Choice {
    wchar_t const* word;
    void (*body)();
};
constexpr std::array kChoices{
    Choice{L"Attribute", writeAttribute}, Choice{L"Definition", writeDefinition},
    Choice{L"Entity", editHeldText},      Choice{L"Identity", editById},
    Choice{L"Markup", editMarkup},        Choice{L"NEw", writeNew},
    Choice{L"NOthing", writeNothing},     Choice{L"Selected", editSelected},
};

}  // namespace

void noteCommand() {
    tzedInitGet(1, L"Attribute Definition Entity Identity Markup NEw NOthing Selected");
    TzString word;
    if (tzedGetKword(L"\nNote [Attribute/Definition/Entity/Identity/Markup/NEw/NOthing/Selected]: ",
                     word) != Tzad::ePromptNormal)
        return;
    for (Choice const& choice : kChoices)
        if (word == choice.word) choice.body();
}

}  // namespace marks
