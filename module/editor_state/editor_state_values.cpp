// The values of a session that are kept as they are given.

#include "tz/mte/editor_state.h"

void CMTextEditorState::SetDialogName(CStdStrW const& name) {
    m_sDialogName = name;
}

CStdStrW CMTextEditorState::GetDialogName() const {
    return m_sDialogName;
}

void CMTextEditorState::SetBkColor(unsigned int rgb) {
    m_nBkColor = rgb;
}

unsigned int CMTextEditorState::GetBkColor() const {
    return m_nBkColor;
}

void CMTextEditorState::SetInitialColor(unsigned int rgb) {
    m_nInitialColor = rgb;
}

unsigned int CMTextEditorState::GetInitialColor() const {
    return m_nInitialColor;
}

void CMTextEditorState::SetStyle(CStdStrW const& style) {
    m_sStyle = style;
}

CStdStrW CMTextEditorState::GetStyle() const {
    return m_sStyle;
}

void CMTextEditorState::SetAlignment(Alignment alignment) {
    m_eAlignment = alignment;
}

CMTextEditorState::Alignment CMTextEditorState::GetAlignment() const {
    return m_eAlignment;
}

void CMTextEditorState::SetWidth(double width) {
    m_dWidth = width;
}

double CMTextEditorState::GetWidth() const {
    return m_dWidth;
}

void CMTextEditorState::SetRotation(double radians) {
    m_dRotation = radians;
}

double CMTextEditorState::GetRotation() const {
    return m_dRotation;
}

void CMTextEditorState::SetActiveTab(EditTab tab) {
    m_eActiveTab = tab;
}

CMTextEditorState::EditTab CMTextEditorState::GetActiveTab() const {
    return m_eActiveTab;
}

void CMTextEditorState::SetLineSpacingStyle(LineSpacingStyle style) {
    m_eLineSpacingStyle = style;
}

CMTextEditorState::LineSpacingStyle CMTextEditorState::GetLineSpacingStyle() const {
    return m_eLineSpacingStyle;
}

void CMTextEditorState::SetLineSpacingFactor(double factor) {
    m_dLineSpacingFactor = factor;
}

double CMTextEditorState::GetLineSpacingFactor() const {
    return m_dLineSpacingFactor;
}

void CMTextEditorState::SetBackgroundFill(int fill) {
    m_nBackgroundFill = fill;
}

int CMTextEditorState::GetBackgroundFill() const {
    return m_nBackgroundFill;
}

void CMTextEditorState::SetBackgroundFillColor(TzCmColor const& color) {
    m_backgroundFillColor = color;
}

TzCmColor CMTextEditorState::GetBackgroundFillColor() const {
    return m_backgroundFillColor;
}

void CMTextEditorState::SetBackgroundFillScale(double scale) {
    m_dBackgroundFillScale = scale;
}

double CMTextEditorState::GetBackgroundFillScale() const {
    return m_dBackgroundFillScale;
}

void CMTextEditorState::SetBackgroundFillTransparency(TzCmTransparency const& transparency) {
    m_backgroundFillTransparency = transparency;
}

TzCmTransparency CMTextEditorState::GetBackgroundFillTransparency() const {
    return m_backgroundFillTransparency;
}

void CMTextEditorState::SetBackgroundFillUseBackgroundColor(bool use) {
    m_bBackgroundFillUseBackgroundColor = use;
}

bool CMTextEditorState::GetBackgroundFillUseBackgroundColor() const {
    return m_bBackgroundFillUseBackgroundColor;
}

void CMTextEditorState::SetMTextFieldObject(TzDbField* field) {
    m_pFieldObject = field;
}

TzDbField* CMTextEditorState::GetMTextFieldObject() const {
    return m_pFieldObject;
}

void CMTextEditorState::SetMTextDatabase(TzDbDatabase* database) {
    m_pDatabase = database;
}

TzDbDatabase* CMTextEditorState::GetMTextDatabase() const {
    return m_pDatabase;
}

void CMTextEditorState::SetAllowFields(bool allow) {
    m_bAllowFields = allow;
}

bool CMTextEditorState::AllowFields() const {
    return m_bAllowFields;
}

void CMTextEditorState::SetNominalTextSize(double size) {
    m_dNominalTextSize = size;
}

double CMTextEditorState::GetNominalTextSize() const {
    return m_dNominalTextSize;
}

void CMTextEditorState::SetEditorOptions(unsigned int options) {
    m_nEditorOptions = options;
}

void CMTextEditorState::SetTabsAllowed(bool allowed) {
    m_bTabsAllowed = allowed;
}

unsigned int CMTextEditorState::GetByLayerColor() const {
    return m_nByLayerColor;
}

unsigned int CMTextEditorState::GetByBlockColor() const {
    return m_nByBlockColor;
}

unsigned int CMTextEditorState::GetConversionResults() const {
    return m_nIncidents;
}

TzArray<TzDbField*> const& CMTextEditorState::GetMTextFieldArray() const {
    return m_aFields;
}
