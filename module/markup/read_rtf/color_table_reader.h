#pragma once

class CRichTextColorTable;

// The colour table of a document, from the character after its word on. The closing brace is left
// to the reader of groups.
void readColorTable(wchar_t const*& cursor, CRichTextColorTable& colors);
