#include "tz/ed/editors.h"

#include <cstring>

#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "host/editors/markup_session.h"
#include "host/runtime/class_registry.h"
#include "host/runtime/notification.h"
#include "host/settings/variables.h"
#include "tz/ap/host_dialog.h"
#include "tz/db/mtext.h"
#include "tz/mte/dialog_params.h"

namespace tzhost {
namespace {

constexpr int kLeft = 0;
constexpr int kAccepted = 1;

// How one number of the in-place editor's record is read.
enum class Field { byte, word, half, real };

struct SettingsField {
    std::size_t offset;
    Field field;
};

constexpr SettingsField kSettingsFields[] = {
    {0,   Field::byte},
    {4,   Field::byte},
    {5,   Field::byte},
    {6,   Field::byte},
    {12,  Field::word},
    {16,  Field::real},
    {40,  Field::real},
    {192, Field::word},
    {196, Field::word},
    {200, Field::word},
    {204, Field::word},
    {208, Field::word},
    {212, Field::half},
    {216, Field::word},
    {220, Field::word},
};

template <class Number>
Number readAt(IPESettings const& settings, std::size_t offset) {
    Number number;
    std::memcpy(&number, reinterpret_cast<char const*>(&settings) + offset, sizeof number);
    return number;
}

double numberAt(IPESettings const& settings, SettingsField const& row) {
    switch (row.field) {
    case Field::byte: return readAt<std::uint8_t>(settings, row.offset);
    case Field::half: return readAt<std::uint16_t>(settings, row.offset);
    case Field::word: return readAt<std::uint32_t>(settings, row.offset);
    case Field::real: return readAt<double>(settings, row.offset);
    }
    return 0;
}

// The record as an object from byte offset to number; zeros are left out.
Event describe(IPESettings const& settings) {
    Event numbers = Event::object();
    for (SettingsField const& row : kSettingsFields) {
        double const number = numberAt(settings, row);
        if (number == 0) continue;
        std::string const key = std::to_string(row.offset);
        if (row.field == Field::real) {
            numbers[key] = number;
        } else {
            numbers[key] = static_cast<std::uint32_t>(number);
        }
    }
    return numbers;
}

// Only the in-place editor has settings.
void reportEditor(char const* kind, bool accepted, IPESettings const* settings) {
    reportEvent([&] {
        Event event{
            {"event",    "editor"},
            {"kind",     kind    },
            {"accepted", accepted}
        };
        if (settings) event["settings"] = describe(*settings);
        return event;
    });
}

// Edits the text's contents with a program or the script's block; kAccepted or kLeft.
int runSession(TzDbMText& text,
               char const* kind,
               std::string const& program,
               IPESettings const* settings) {
    std::optional<TzString> const contents = editMarkup(text.contents(), program);
    bool const accepted = contents && text.setContents(contents->kwszPtr()) == Tzad::eOk;
    reportEditor(kind, accepted, settings);
    return accepted ? kAccepted : kLeft;
}

// Runs the editor on the plain markup for its dialog's parameters.
void runRawEditor(TzApHostDialogParams& params) {
    auto const& raw = static_cast<TzApHostRawEditorParamsFrameless const&>(params);
    EasyObject<TzDbMText> const* const text = raw.easyMText();
    if (!text || !text->object) return params.setReturnCode(3);
    std::string const& program = editorConfiguration().textEditor;
    params.setReturnCode(runSession(*text->object, "raw", program, nullptr) == kAccepted ? 1 : 2);
}

struct DialogRow {
    wchar_t const* parameterClass;
    void (*run)(TzApHostDialogParams&);
};

constexpr DialogRow kDialogs[] = {
    {L"TzApHostRawEditorParamsFrameless", runRawEditor},
};

}  // namespace
}  // namespace tzhost

int IPEInvokeEditorOn(TzDbMText* text, IPESettings const* settings) {
    if (tzhost::faultAt("IPEInvokeEditorOn") || !text || !settings) return tzhost::kLeft;
    std::string const& program = tzhost::editorConfiguration().textEditor;
    return tzhost::runSession(*text, "inPlace", program, settings);
}

bool IPEIsEditor(bool /*current*/) {
    if (tzhost::faultAt("IPEIsEditor")) return false;
    TzString const name(tzhost::Variables::instance().text(L"MTEXTED"));
    for (std::wstring const& each : tzhost::editorConfiguration().inPlaceEditors) {
        if (name.compareNoCase(each.c_str()) == 0) return true;
    }
    return false;
}

int tzedEditMTextInteractive(TzDbMText* text, bool /*interactive*/, bool /*view*/) {
    if (tzhost::faultAt("tzedEditMTextInteractive") || !text) return tzhost::kLeft;
    TzString const program(tzhost::Variables::instance().text(L"MTEXTED"));
    return tzhost::runSession(*text, "external", program.toUtf8(), nullptr);
}

void tzedSetExistingMText(bool existing) {
    tzhost::reportNotification(existing ? "existingMText" : "newMText");
}

int tzedInvokeAnnoSelectScaleDlg() {
    tzhost::reportNotification("annotationScaleDialog");
    return Tzad::ePromptNormal;
}

void tzedUpdateDisplay() {
    tzhost::reportNotification("updateDisplay");
}

void tzedZoomToolHook(bool /*in*/, bool /*out*/, bool /*redraw*/) {
    tzhost::reportNotification("zoomTool");
}

void TzApHostDialogImp::run(TzApHostDialogParams& params) {
    params.setReturnCode(3);
    if (tzhost::faultAt("TzApHostDialogImp::run")) return;
    TzString const name(params.isA() ? params.isA()->name() : L"");
    for (tzhost::DialogRow const& row : tzhost::kDialogs) {
        if (name == row.parameterClass) return row.run(params);
    }
}

TzRxClass* TzApHostDialogParams::desc() {
    static TzRxClass* const descriptor =
        tzhost::hostClass(L"TzApHostDialogParams", TzRxObject::desc());
    return descriptor;
}
TzRxClass* TzApHostDialogParams::isA() const {
    return desc();
}

void TzApHostDialog::doModal(TzApHostDialogParams& params) {
    imp_->run(params);
}
