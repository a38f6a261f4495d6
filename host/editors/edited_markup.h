#pragma once

#include "host/editors/edited_text.h"
#include "tz/db/mtext.h"
#include "tz/text/string.h"

// The markup of a multi-line text, as the in-place, the raw and the external editor show it: UTF-8,
// one paragraph a line (markup_lines.h), fields as their codes.
//
//   EditedMarkup markup(text);  // a TzDbMText that is open for write
//   if (!markup.canBeRead()) return;
//   if (runEditorSession(markup, program) == SessionEnd::accepted) ...
namespace tzhost {

class EditedMarkup : public EditedText {
public:
    // Reads the markup. The text outlives this object.
    explicit EditedMarkup(TzDbMText& text);

    // False when the text has a field that cannot be opened: the codes of the field are unknown,
    // and a new text would drop it.
    [[nodiscard]] bool canBeRead() const { return canBeRead_; }

    [[nodiscard]] char const* fileName() const override { return "mtext.txt"; }
    [[nodiscard]] std::string bytes() const override;
    [[nodiscard]] bool isEmpty() const override { return markup_.isEmpty(); }
    [[nodiscard]] TakenText take(std::string_view left) override;

private:
    TzDbMText& text_;
    TzString markup_;
    bool canBeRead_;
};

}  // namespace tzhost
