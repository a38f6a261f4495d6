#pragma once

#include <string>

#include "host/layout/markup_reader.h"

// Reads a document that the markup was converted to, as what it shows: pieces of one look. It knows
// the words that the converter writes and those alone.
namespace markuptest {

// `halfPoints` of the document are one unit of height, `twips` one unit of an indent.
struct DocumentScale {
    double halfPoints = 1.0;
    double twips = 1.0;
};

// Colours come as true colours but for entry 0 of the table, which is the entity's. Font 0 in its
// plain form is font 0; the others are found by face, bold and italic alone.
[[nodiscard]] tzhost::MarkupText readDocument(std::wstring const& document, DocumentScale scale);

}  // namespace markuptest
