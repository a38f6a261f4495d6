#pragma once

#include <string>

#include "tz/export.h"
#include "tz/text/code_page.h"
#include "tz/text/std_str.h"

class TzDbMText;

// The engine that reads a multi-line text's markup for an editor. Modules derive from it; a run is
//   1. initialize with the markup
//   2. from_mtext
//   3. uninitialize
//
// Markup of a newer format than this host's declares it with `\?N;` at its start.
class TZ_API TextEditor {
public:
    // The text to edit, which may be null and is not owned. The flags and sizes are for an engine
    // that lays the text out; this one keeps none of them.
    TextEditor(TzDbMText* text,
               bool editing,
               bool fixedWidth,
               bool fixedHeight,
               bool oneLine,
               double width,
               double height,
               double textHeight,
               bool attribute,
               bool vertical);
    virtual ~TextEditor();
    TextEditor(TextEditor const&) = delete;
    TextEditor& operator=(TextEditor const&) = delete;

    // [any] Takes the markup. What it cannot make sense of stays in `unreadable_`.
    void initialize(wchar_t const* contents);
    // [any] Drops the markup and what was learned of it.
    void uninitialize();
    // [initialized] The format that the markup declares, 0 without a mark; a number that does not
    // fit gives the largest int.
    [[nodiscard]] int from_mtext(wchar_t const* contents);

    // [any] The bytes of a text in a page; a character that the page lacks becomes "?".
    [[nodiscard]] static std::string UnicodeToMultiByte(CStdStrW const& text, code_page_id page);

protected:
    // The entity; not owned.
    TzDbMText* text_;
    // Set by initialize: the mark of a format that has no number; empty for markup that can be
    // read.
    CStdStrW unreadable_;
};
