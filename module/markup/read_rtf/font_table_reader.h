#pragma once

class CRichTextFontTable;

// The font table of a document, from the character after its word on. The closing brace of the
// table is consumed, so that the reader of groups is one group deeper after the table than the
// document is.
void readFontTable(wchar_t const*& cursor, CRichTextFontTable& fonts);
