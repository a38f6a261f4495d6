#pragma once

#include <unordered_map>

#include "module/markup/shared/font_name.h"
#include "module/markup/shared/text_hash.h"
#include "tz/text/charset.h"
#include "tz/text/std_str.h"

// The fonts of a rich text document by their numbers, its slots. A writer adds fonts and gets their
// numbers; a reader stores each under the number that the document gives it, from 0 up, with gaps
// of any size between them.
//
//   CRichTextFontTable fonts;
//   fonts.AddFont(L"Arial", kAnsiCharset, 0x22);   // 0
//   fonts.EmitFontTable();                         // {\fonttbl{\f0\fswiss\fprq2\fcharset0 Arial;}}
class CRichTextFontTable {
public:
    struct Record {
        Charset charset = kAnsiCharset;
        int pitchAndFamily = 0;
        FontName name;
        bool isInterned = false;  // the name is of the pool; so once asked for
    };

    CRichTextFontTable() = default;
    virtual ~CRichTextFontTable() = default;
    CRichTextFontTable(CRichTextFontTable const&) = delete;
    CRichTextFontTable& operator=(CRichTextFontTable const&) = delete;

    // The first slot of that description, case not counting, or -1.
    [[nodiscard]] int FindFont(wchar_t const* name, Charset charset, int pitch);
    // The slot found, else a new one at the end.
    int AddFont(wchar_t const* name, Charset charset, int pitch);
    // Stores under a number, in the place of what was there; a negative number is dropped.
    void AddFont(long long slot, wchar_t const* name, Charset charset, int pitch);
    // False, with an empty name and zeros, for an empty slot.
    [[nodiscard]] bool GetFont(int slot, CStdStrW& name, Charset& charset, int& pitch) const;

    // The table as a group, in the order of the slots.
    [[nodiscard]] CStdStrW EmitFontTable() const;

protected:
    // Null for an empty slot; valid until the slot is stored to. The name of the record comes from
    // names().
    [[nodiscard]] Record const* fontAt(int slot);
    // The names of this document; the owner's own names come from here too.
    FontNamePool& names() { return names_; }

private:
    void indexSlots();

    FontNamePool names_;
    std::unordered_map<int, Record> m_aFonts;
    long long length_ = 0;  // after the highest slot
    // By description, for writers.
    TextTable<int> firstSlots_;
    bool isIndexed_ = true;  // false once a reader has stored to a slot
};
