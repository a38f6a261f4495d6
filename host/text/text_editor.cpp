#include "tz/text/text_editor.h"

#include <climits>

namespace {

// `\?` digits `;` at the start of a markup.
struct FormatMark {
    bool isThere = false;
    bool hasNumber = false;
    int number = 0;
    std::size_t length = 0;
};

FormatMark readMark(CStdStrW const& markup) {
    FormatMark mark;
    if (markup.compare(0, 2, L"\\?") != 0) return mark;
    mark.length = 2;
    for (; mark.length < markup.size(); ++mark.length) {
        wchar_t const c = markup[mark.length];
        if (c < L'0' || c > L'9') break;
        int const digit = c - L'0';
        mark.hasNumber = true;
        mark.number = mark.number > (INT_MAX - digit) / 10 ? INT_MAX : mark.number * 10 + digit;
    }
    mark.isThere = mark.length < markup.size() && markup[mark.length] == L';';
    if (mark.isThere) ++mark.length;
    return mark;
}

}  // namespace

TextEditor::TextEditor(TzDbMText* text, bool, bool, bool, bool, double, double, double, bool, bool)
    : text_(text) {}

TextEditor::~TextEditor() = default;

void TextEditor::initialize(wchar_t const* contents) {
    CStdStrW const markup(contents);
    FormatMark const mark = readMark(markup);
    unreadable_ =
        mark.isThere && !mark.hasNumber ? markup.Left(static_cast<int>(mark.length)) : L"";
}

void TextEditor::uninitialize() {
    unreadable_.clear();
}

int TextEditor::from_mtext(wchar_t const* contents) {
    FormatMark const mark = readMark(contents);
    return mark.isThere ? mark.number : 0;
}

std::string TextEditor::UnicodeToMultiByte(CStdStrW const& text, code_page_id page) {
    return UnicodeConvert::wideToMultibyte(page, text);
}
