#pragma once

// The outline fonts of the machine by file and by exact family name, read from fontconfig once, at
// the first question. When a font is missing, fontconfig answers with a substitute; this catalogue
// knows only the fonts that are installed.
//
//   FontFamilyRow const* const family = FontCatalogue::instance().family(L"DejaVu Sans");
//   FontForm const& regular = family->nearest(false, false);
//
// Names count without case. Everything lives with the process.

#include <deque>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include <fontconfig/fontconfig.h>

#include "tz/text/charset.h"

namespace tzhost {

// One face of one file.
struct FontForm {
    std::string path;
    std::wstring fileName;           // without folder
    int index = 0;                   // in a collection
    std::wstring english;            // the family name that leads back to this file, in English
    int weight = FC_WEIGHT_REGULAR;  // fontconfig's numbers
    int slant = FC_SLANT_ROMAN;
    int width = FC_WIDTH_NORMAL;
    bool isFixedPitch = false;
    FcCharSet const* characters = nullptr;  // of the process

    [[nodiscard]] bool isBold() const { return weight >= FC_WEIGHT_DEMIBOLD; }
    [[nodiscard]] bool isItalic() const { return slant != FC_SLANT_ROMAN; }
};

// All forms under one name.
struct FontFamilyRow {
    std::wstring english;
    std::wstring native;  // in another language than English; the English one when there is none
    std::vector<FontForm const*> forms;  // never empty

    // The form that is asked for, else the one that differs least: in slant, then in weight and
    // width.
    [[nodiscard]] FontForm const& nearest(bool bold, bool italic) const;
    [[nodiscard]] bool has(bool bold, bool italic) const;
};

class FontCatalogue {
public:
    [[nodiscard]] static FontCatalogue const& instance();

    // By any of its names; null for an unknown one.
    [[nodiscard]] FontFamilyRow const* family(std::wstring_view name) const;
    // By the name of the file; a folder before the name is ignored. Null for an unknown file.
    [[nodiscard]] FontForm const* file(std::wstring_view name) const;
    // Every family once, under its English name, by name.
    [[nodiscard]] std::vector<FontFamilyRow const*> families() const;

    FontCatalogue(FontCatalogue const&) = delete;
    FontCatalogue& operator=(FontCatalogue const&) = delete;

private:
    FontCatalogue();
    void add(FcPattern* pattern);
    void nameForms();

    std::deque<FontForm> forms_;                    // a deque: addresses stay valid
    std::map<std::wstring, FontFamilyRow> byName_;  // in lower case
    std::map<std::wstring, FontForm const*> byFile_;
};

// The charset of a form: 0 when it holds the letters of the system page, else the first of 128,
// 129, 134, 136, 204, 161, 177, 178 and 222 whose letters it holds, else 1. Remembered per form and
// page.
[[nodiscard]] Charset charsetOf(FontForm const& form);

}  // namespace tzhost
