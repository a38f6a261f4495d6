#include "tz/mte/editor_state.h"

#include <algorithm>
#include <climits>
#include <cstdint>
#include <memory>

#include "module/host_calls/sys_var.h"
#include "module/markup/session/conversion_session.h"
#include "module/styles/drawing_colors.h"
#include "module/styles/stack_defaults.h"
#include "tz/mte/dialog_params.h"
#include "tz/mte/globals.h"
#include "tz/pal/registry.h"

namespace {

constexpr int kTwipsPerPoint = 20;
// The point size of the text in the editor, and the limits of sizes, in points.
constexpr int kNormalPoints = 16;
constexpr int kLeastNormalPoints = 8;
constexpr int kMostNormalPoints = 72;
constexpr int kLargestPoints = 128;
constexpr int kLargestPointsAtMost = 256;
constexpr int kSmallestPoints = 6;

// A number of the module's registry key; `fallback` when it has none of that name and type.
int registryPoints(wchar_t const* name, int fallback) {
    CTwUiRegistryAccess registry;
    std::uint32_t value = 0;
    std::uint32_t type = 0;
    if (!registry.Open(HKEY_CURRENT_USER, gsMtextRegistryKey.kwszPtr()) ||
        !registry.GetDword(name, value, type) || type != REG_DWORD)
        return fallback;
    return value > INT_MAX ? INT_MAX : static_cast<int>(value);
}

// A window that stands at a fixed place has the registry's size, any other the size at which the
// text stands on the screen.
int normalPoints() {
    int points = registryPoints(L"Normal Point Size", kNormalPoints);
    if (gMTextFixed)
        giPoints = points;
    else
        points = giPoints;
    return std::clamp(points, kLeastNormalPoints, kMostNormalPoints);
}

int largestPoints(int normal) {
    int const points = registryPoints(L"Max Point Size", kLargestPoints);
    return points < normal ? normal : std::min(points, kLargestPointsAtMost);
}

int smallestPoints(int normal) {
    int const points = registryPoints(L"Min Point Size", kSmallestPoints);
    return points < kSmallestPoints ? kSmallestPoints : std::min(points, normal);
}

}  // namespace

CMTextEditorState::CMTextEditorState() : m_eVerticalAlignment(GetDefaultStackAlignment()) {
    SetInitialTwipSize(normalPoints() * kTwipsPerPoint);
    int const normal = GetInitialTwipSize() / kTwipsPerPoint;
    m_nMaximumTwipSize = largestPoints(normal) * kTwipsPerPoint;
    m_nMinimumTwipSize = smallestPoints(normal) * kTwipsPerPoint;
    SetBkColor(tzedGetRGB(0));
}

CMTextEditorState::~CMTextEditorState() {
    DestroyWaitCursor();
}

void CMTextEditorState::SetInitialSize(double size) {
    SetNominalTextSize(size);
    m_fontScale.SetScaleUnits(size);
    m_marginScale.SetScaleUnits(size);
}

double CMTextEditorState::GetInitialSize() const {
    return GetNominalTextSize();
}

void CMTextEditorState::SetInitialTwipSize(int twips) {
    m_fontScale.SetScaleTwips(twips);
    m_marginScale.SetScaleTwips(twips);
}

int CMTextEditorState::GetInitialTwipSize() const {
    return m_fontScale.GetScaleTwips();
}

void CMTextEditorState::SetByLayerColor(unsigned int rgb) {
    m_nByLayerColor = colorBeside(rgb, m_nByBlockColor);
}

void CMTextEditorState::SetByBlockColor(unsigned int rgb) {
    m_nByBlockColor = colorBeside(rgb, m_nByLayerColor);
}

void CMTextEditorState::SetCaptionString(CStdStrW const& caption) {
    CreateWaitCursor();
    m_sCaption = caption;
}

void CMTextEditorState::SetMTextFieldArray(TzArray<TzDbField*> const& fields) {
    TzArray<TzDbField*> const given(fields);  // they may be this session's own
    m_aFields.removeAll();
    m_aFields.append(given);
}

void CMTextEditorState::CreateWaitCursor() {
    if (!m_pWaitCursor) m_pWaitCursor = new CWaitCursor;
}

void CMTextEditorState::DestroyWaitCursor() {
    delete m_pWaitCursor;
    m_pWaitCursor = nullptr;
}

int CMTextEditorState::DoModal() {
    TzApHostOldEditorParamsFrameless params;
    params.setMTextEditorState(this);
    TzApHostDialogOldEditor::instance().doModal(params);
    return params.returnCode();
}

CMTextEditorInterface* new_CMTextEditorInterface() {
    auto state = std::make_unique<CMTextEditorState>();
    state->SetInitialSize(CTzadSysVar::GetDouble(L"TEXTSIZE"));
    state->SetInitialColor(GetCurrentDrawingByLayerColor());
    state->SetStyle(CTzadSysVar::GetString(L"TEXTSTYLE"));
    return state.release();
}

void delete_CMTextEditorInterface(CMTextEditorInterface* editor) {
    delete editor;
}
