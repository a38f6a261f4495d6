#pragma once

#include "tz/export.h"
#include "tz/rx/object.h"
#include "tz/text/string.h"

// Dialogs that the host shows for a module: the module hands over an object with parameters, whose
// class says which dialog it is, and reads the result from it.
//
//   MyParams params;
//   TzApHostDialog& dialog = MyDialog::instance();
//   dialog.doModal(params);
//   int result = params.returnCode();

// Parameters of one run.
class TZ_API TzApHostDialogParams : public TzRxObject {
public:
    // What the dialog ended with; 1 accepted, 2 cancelled, 3 no dialog ran. 2 at the start.
    [[nodiscard]] int returnCode() const { return returnCode_; }
    void setReturnCode(int code) { returnCode_ = code; }

    static TzRxClass* desc();
    [[nodiscard]] TzRxClass* isA() const override;

private:
    int returnCode_ = 2;
};

// The host's side of a dialog.
class TZ_API TzApHostDialogImp {
public:
    // The module that the dialog belongs to, by its file name.
    explicit TzApHostDialogImp(wchar_t const* module) : module_(module) {}
    // [command] Runs the dialog for the parameters' class and stores the result in them; a class
    // that no dialog serves gives 3.
    void run(TzApHostDialogParams& params);
    [[nodiscard]] TzString const& module() const { return module_; }

private:
    TzString module_;
};

// Base of a module's dialog; it does not own the host's side.
class TZ_API TzApHostDialog {
public:
    explicit TzApHostDialog(TzApHostDialogImp* imp) : imp_(imp) {}
    virtual void doModal(TzApHostDialogParams& params);
    virtual ~TzApHostDialog() = default;

private:
    TzApHostDialogImp* imp_;
};
