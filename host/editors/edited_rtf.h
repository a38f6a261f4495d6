#pragma once

#include <string>

#include "host/editors/dialog_values.h"
#include "host/editors/edited_text.h"
#include "tz/mte/editor_interface.h"

// The text of a dialog's session as a rich-text document for a word processor, and what such a
// program leaves as a document that the module reads. Lines `NAME=VALUE` before the document
// change the values of dialog_values.h; without a document after them the words stay.
//
//   EditedRtf rtf(state);  // the state of the session
//   if (!rtf.failure().empty()) return;
//   if (runEditorSession(rtf, program) == SessionEnd::accepted) ...
namespace tzhost {

class RtfReplacements;

class EditedRtf : public EditedText {
public:
    // Reads the document. The state outlives this object.
    explicit EditedRtf(CMTextEditorInterface& state);

    // What the module gave instead of a document, which is the text of its failure; empty when
    // there is a document.
    [[nodiscard]] std::wstring const& failure() const { return failure_; }
    // Changes of values that were made before the session; they count when the text is taken.
    void setChanges(DialogChanges changes) { changes_ = std::move(changes); }

    [[nodiscard]] char const* fileName() const override { return "mtext.rtf"; }
    [[nodiscard]] std::string bytes() const override { return sent_; }
    [[nodiscard]] bool isEmpty() const override { return isEmpty_; }
    [[nodiscard]] TakenText take(std::string_view left) override;

private:
    [[nodiscard]] std::string readChanges(std::string_view& left, DialogChanges& changes) const;
    [[nodiscard]] bool takeDocument(std::string_view left, RtfReplacements const& replacements);

    CMTextEditorInterface& state_;
    bool isEmpty_;
    std::wstring failure_;
    std::string sent_;
    DialogChanges changes_;
};

}  // namespace tzhost
