#include "host/base/memory_faults.h"
#include "host/database/drawing.h"
#include "host/database/exact_values.h"
#include "host/database/symbol_imp.h"
#include "host/settings/variables.h"
#include "tz/ge/matrix3d.h"

// What a drawing holds beside its objects: current style and layer, user systems, the working set.
namespace tzhost {
namespace {

// A record of that table which is not erased.
bool isRecordOf(TzDbObjectId id, TzDbObjectId table) {
    return !id.isNull() && !id.isErased() && id.record()->owner == table.record();
}

}  // namespace

TzGeMatrix3d UserSystem::matrix() const {
    TzGeMatrix3d result;
    return result.setCoordSystem(origin, xAxis, yAxis, xAxis.crossProduct(yAxis));
}

bool UserSystem::isSameAs(UserSystem const& other) const {
    return isExactly(origin, other.origin) && isExactly(xAxis, other.xAxis) &&
           isExactly(yAxis, other.yAxis);
}

bool DrawingSettings::isSameAs(DrawingSettings const& other) const {
    return textStyle == other.textStyle && layer == other.layer &&
           modelSystem.isSameAs(other.modelSystem) && paperSystem.isSameAs(other.paperSystem) &&
           workingSetExists == other.workingSetExists &&
           workingSetActive == other.workingSetActive && workingAngle == other.workingAngle &&
           page == other.page;
}

void Drawing::setSettings(DrawingSettings const& settings) {
    settings_ = settings;
    std::wstring const& name = valuesOf<SymbolImp>(*settings.textStyle.record()->object).name;
    (void)Variables::instance().setKept(L"TEXTSTYLE", name);  // a text of any length is taken
}

Tzad::ErrorStatus Drawing::setTextstyle(TzDbObjectId style) {
    if (auto const fault = faultStatus("TzDbDatabase::setTextstyle")) return fault;
    if (!isRecordOf(style, textStyles_)) return Tzad::eWrongObjectType;
    DrawingSettings next = settings_;
    next.textStyle = style;
    setSettings(next);
    return Tzad::eOk;
}

Tzad::ErrorStatus Drawing::setClayer(TzDbObjectId layer) {
    if (auto const fault = faultStatus("TzDbDatabase::setClayer")) return fault;
    if (!isRecordOf(layer, layers_)) return Tzad::eWrongObjectType;
    settings_.layer = layer;
    return Tzad::eOk;
}

bool Drawing::orthomode() const {
    return Variables::instance().number(L"ORTHOMODE") != 0;
}

// Previews turn the mode off and give it back by this, so it is set even when the fault plan makes
// the call report a failure.
Tzad::ErrorStatus Drawing::setOrthomode(bool on) {
    tzhost::MemoryFaultPause const givesBack;
    Tzad::ErrorStatus const fault = faultStatus("TzDbDatabase::setOrthomode");
    VariableValue const value = static_cast<short>(on ? 1 : 0);
    bool const done = Variables::instance().set(L"ORTHOMODE", value, Writer::host).isDone();
    if (!done) return Tzad::eInternal;
    return fault;
}

}  // namespace tzhost
