#include "tz/mte/mtext_command.h"

#include "module/geometry/points.h"
#include "module/geometry/user_axes.h"
#include "module/host_calls/class_registration.h"
#include "module/styles/line_spacing.h"
#include "module/styles/style_rules.h"
#include "module/texts/attachment_ids.h"
#include "tz/db/host_services.h"
#include "tz/ed/variables.h"

namespace {

constexpr int kCommandComponent = 7;

// How MTEXTCOLUMN sets the columns of a new text.
struct ColumnSetting {
    int variable;
    int columnType;
    bool setsAutoHeight;
    bool autoHeight;
};
constexpr ColumnSetting kColumnSettings[] = {
    {0, TzDbMText::kNoColumns, false, false},
    {1, TzDbMText::kDynamicColumns, true, true},
    {2, TzDbMText::kDynamicColumns, true, false},
};

double workingAngle() {
    TzDbWorkingGlobals const* globals = tzdbHostApplicationServices()->workingGlobals();
    return (globals ? globals : tzdbDefaultWorkingGlobals())->workingAngle();
}

TzRxObject* createCommand() {
    return new TzxMtextCommand;
}

}  // namespace

TzxMtextCommandBase::TzxMtextCommandBase()
    : styleName(GetCurrentTextStyleName()), telemetry(kCommandComponent, L"MText") {
    ComputeTextSize();
    lineSpacingFactor = GetLineSpacingFactor();
    lineSpacingStyle = GetLineSpacingStyle();
}

bool TzxMtextCommandBase::IsStyleNameOK(TzString const& name) const {
    return !GetTextStyleID(name).isNull();
}

void TzxMtextCommandBase::ComputeTextSize() {
    textHeight = ::ComputeTextSize(GetTextStyleID(styleName));
}

void TzxMtextCommandBase::ResetLineSpacing() {
    lineSpacingFactor = 1.0;
    lineSpacingStyle = TzDb::kAtLeast;
}

bool TzxMtextCommandBase::ValidateLineSpacingFactor(double factor) {
    FixLineSpacingFactor(factor, textHeight);
    if (!::ValidateLineSpacingFactor(factor)) return false;
    lineSpacingFactor = factor;
    return true;
}

void TzxMtextCommandBase::setMTextOptionsFrom(TzDbMText* entity) {
    attachmentId = MapAttachmentToIDS(entity->attachment());
    boxWidth = entity->width();
    textHeight = entity->textHeight();
    lineSpacingStyle = entity->lineSpacingStyle();
    lineSpacingFactor = entity->lineSpacingFactor();
    setCoordinates(location, entity->location());
    styleName = GetTextStyleName(entity->textStyle());
    rotation = entity->rotation() + workingAngle();
}

// A value that the entity refuses leaves the entity's own.
void TzxMtextCommandBase::setMTextOptionsTo(TzDbMText* entity) const {
    (void)entity->setAttachment(MapAttachment(attachmentId));
    (void)entity->setWidth(boxWidth);
    (void)entity->setTextStyle(GetTextStyleID(styleName));
    (void)entity->setTextHeight(textHeight);
    (void)entity->setLineSpacingStyle(static_cast<TzDb::LineSpacingStyle>(lineSpacingStyle));
    (void)entity->setLineSpacingFactor(lineSpacingFactor);
    (void)entity->setLocation(pointOf(location));
    UserAxes const axes = activeUserAxes();
    (void)entity->setNormal(axes.normal);
    (void)entity->setDirection(axes.turned(rotation).x.normalize());
}

TzRxClass* TzxMtextCommand::gpDesc = nullptr;

TzxMtextCommand::TzxMtextCommand() {
    resbuf setting{};
    if (tzedGetVar(L"MTEXTCOLUMN", &setting) != Tzad::ePromptNormal) return;
    for (ColumnSetting const& row : kColumnSettings) {
        if (row.variable != setting.resval.rint) continue;
        columns.columnType = row.columnType;
        if (row.setsAutoHeight) columns.autoHeight = row.autoHeight;
    }
}

TzxMtextCommand::~TzxMtextCommand() = default;

TzRxClass* TzxMtextCommand::desc() {
    return gpDesc;
}

TzRxClass* TzxMtextCommand::isA() const {
    return gpDesc;
}

TzRxClass* TzxMtextCommand::rxInit() {
    return registerRuntimeClass(gpDesc, L"TzxMtextCommand", L"TzRxObject", createCommand);
}

void TzxMtextCommand::setInitialProperties(TzGePoint3d const& theLocation,
                                           double width,
                                           double theRotation,
                                           double height,
                                           unsigned int theAttachmentId,
                                           wchar_t const* theStyleName) {
    setCoordinates(location, theLocation);
    boxWidth = width;
    rotation = theRotation;
    textHeight = height;
    attachmentId = theAttachmentId;
    styleName = theStyleName;
}
