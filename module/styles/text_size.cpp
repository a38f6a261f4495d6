#include "module/host_calls/sys_var.h"
#include "module/styles/style_rules.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"

namespace {

constexpr double kFallbackTextHeight = 0.2;

double ownHeightOf(TzDbObjectId style) {
    EasyObject<TzDbTextStyleTableRecord> record;
    if (tzdbOpenObject(record.object, style, TzDb::kForRead) != Tzad::eOk)
        return kFallbackTextHeight;
    return record->textSize();
}

}  // namespace

double annotationScale() {
    return CTzadSysVar::GetDouble(L"CANNOSCALEVALUE");
}

double ComputeTextSize(TzDbObjectId style) {
    double size = ownHeightOf(style);
    if (StyleIsAnnotative(style)) size /= annotationScale();
    if (size == 0) {
        size = CTzadSysVar::GetDouble(L"TEXTSIZE");
        // The variable belongs to the style in force, whichever style is asked about.
        TzDbDatabase const* const database = tzdbHostApplicationServices()->workingDatabase();
        if (database && StyleIsAnnotative(database->textstyle())) size /= annotationScale();
    }
    return size == 0 ? kFallbackTextHeight : size;
}

double ComputeTextSize() {
    return ComputeTextSize(GetTextStyleID(GetCurrentTextStyleName()));
}
