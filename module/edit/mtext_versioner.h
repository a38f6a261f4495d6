#pragma once

#include "tz/text/text_editor.h"

class TzDbMText;

// Tells whether a text was written in a newer format than this module can edit.
//
//   MTextVersioner versioner(text);
//   if (versioner.too_new(text->contents())) return;
class MTextVersioner : public TextEditor {
public:
    // The text may be null; it is not owned.
    explicit MTextVersioner(TzDbMText* text);
    ~MTextVersioner() override;

    // True for contents of a newer format, and then a message box has said so.
    [[nodiscard]] bool too_new(wchar_t const* contents);

private:
    [[nodiscard]] bool isNewer(wchar_t const* contents);
};
