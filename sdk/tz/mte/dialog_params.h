#pragma once

#include "tz/ap/host_dialog.h"
#include "tz/export.h"
#include "tz/mte/easy_object.h"

class CMTextEditorState;
class TzDbMText;

// Parameters of the two editors that run as dialogs of the host, and the dialogs' handles.
//
//   TzApHostRawEditorParamsFrameless params;
//   params.setEasyMText(&text);
//   TzApHostDialogRawEditor::instance().doModal(params);
//   int result = params.returnCode();
//
// Nothing here owns what it points to; the caller keeps it alive for the run. What the host calls
// on the parameters is inline.

// The values that both parameter classes hold.
class TzApHostEditorParamsImp {
public:
    [[nodiscard]] EasyObject<TzDbMText>* easyMText() const { return easyMText_; }
    void setEasyMText(EasyObject<TzDbMText>* text) { easyMText_ = text; }
    [[nodiscard]] bool useNewUI() const { return useNewUI_; }
    void setUseNewUI(bool use) { useNewUI_ = use; }
    [[nodiscard]] bool allowTabs() const { return allowTabs_; }
    void setAllowTabs(bool allow) { allowTabs_ = allow; }
    [[nodiscard]] CMTextEditorState* mTextEditorState() const { return mTextEditorState_; }
    void setMTextEditorState(CMTextEditorState* state) { mTextEditorState_ = state; }

private:
    EasyObject<TzDbMText>* easyMText_ = nullptr;
    bool useNewUI_ = false;
    bool allowTabs_ = false;
    CMTextEditorState* mTextEditorState_ = nullptr;
};

// For the editor on the plain markup.
class TZ_API TzApHostRawEditorParamsFrameless : public TzApHostDialogParams {
public:
    TzApHostRawEditorParamsFrameless();
    TzApHostRawEditorParamsFrameless(TzApHostRawEditorParamsFrameless const&) = delete;
    TzApHostRawEditorParamsFrameless& operator=(TzApHostRawEditorParamsFrameless const&) = delete;
    ~TzApHostRawEditorParamsFrameless() override;
    [[nodiscard]] EasyObject<TzDbMText>* easyMText() const { return imp_->easyMText(); }
    void setEasyMText(EasyObject<TzDbMText>* text) { imp_->setEasyMText(text); }

    static TzRxClass* gpDesc;
    static TzRxClass* desc();
    static TzRxClass* rxInit();
    [[nodiscard]] TzRxClass* isA() const override;

private:
    TzApHostEditorParamsImp* imp_;  // owned
};

// For the dialog editor on rich text.
class TZ_API TzApHostOldEditorParamsFrameless : public TzApHostDialogParams {
public:
    TzApHostOldEditorParamsFrameless();
    TzApHostOldEditorParamsFrameless(TzApHostOldEditorParamsFrameless const&) = delete;
    TzApHostOldEditorParamsFrameless& operator=(TzApHostOldEditorParamsFrameless const&) = delete;
    ~TzApHostOldEditorParamsFrameless() override;
    [[nodiscard]] CMTextEditorState* mTextEditorState() const { return imp_->mTextEditorState(); }
    void setMTextEditorState(CMTextEditorState* state) { imp_->setMTextEditorState(state); }

    static TzRxClass* gpDesc;
    static TzRxClass* desc();
    static TzRxClass* rxInit();
    [[nodiscard]] TzRxClass* isA() const override;

private:
    TzApHostEditorParamsImp* imp_;  // owned
};

// [any] Make both parameter classes known to the host, before tzrxBuildClassHierarchy is called,
// and take that back; taking back changes nothing when they are not known. The module calls them at
// its load and unload.
TZ_API void MteCoreDialogParamsRXInit();
TZ_API void MteCoreDialogParamsRXUninit();

// The dialogs, one of each in the process, made on first use.
class TZ_API TzApHostDialogRawEditor : public TzApHostDialog {
public:
    [[nodiscard]] static TzApHostDialogRawEditor& instance();

private:
    using TzApHostDialog::TzApHostDialog;
};

class TZ_API TzApHostDialogOldEditor : public TzApHostDialog {
public:
    [[nodiscard]] static TzApHostDialogOldEditor& instance();

private:
    using TzApHostDialog::TzApHostDialog;
};
