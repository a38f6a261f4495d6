#include "host/editors/edited_markup.h"

#include "host/editors/markup_lines.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "tz/db/field.h"
#include "tz/mte/easy_object.h"

namespace tzhost {
namespace {

constexpr wchar_t const* kTextFieldKey = L"TEXT";

// Replaces the text's evaluated contents by those with the codes of its field, where it has one.
// False when there is a field that cannot be opened.
bool readFieldCode(TzDbMText const& text, TzString& markup) {
    EasyObject<TzDbField> field;  // closes it also when memory is short
    Tzad::ErrorStatus const status = text.getField(kTextFieldKey, field.object, TzDb::kForRead);
    if (status == Tzad::eKeyNotFound) return true;
    if (status != Tzad::eOk) return false;
    markup = field->getFieldCode(0);
    return true;
}

// What is wrong with the bytes that an editor left; empty when they can be taken.
std::string problemOf(std::string_view bytes) {
    if (firstBadByte(bytes) != kAllUtf8) return localText("left a file that is no UTF-8");
    if (bytes.find('\0') != std::string_view::npos)
        return localText("left a file with a zero character");
    return "";
}

std::wstring markupOf(std::string_view bytes) {
    return linesToMarkup(fromUtf8(bytes));
}

}  // namespace

EditedMarkup::EditedMarkup(TzDbMText& text)
    : text_(text), markup_(text.contents()), canBeRead_(readFieldCode(text, markup_)) {}

// A line break at the end keeps editors that demand one quiet.
std::string EditedMarkup::bytes() const {
    return toUtf8(markupToLines(markup_.str())) + "\n";
}

// Compares what both files say: line ends of another system and a byte-order mark change nothing.
TakenText EditedMarkup::take(std::string_view left) {
    left = withoutByteOrderMark(left);
    if (std::string problem = problemOf(left); !problem.empty())
        return {Taken::refused, std::move(problem)};
    std::wstring const markup = markupOf(left);
    if (markup == markupOf(bytes())) return {Taken::unchanged, ""};
    if (text_.setContents(markup.c_str()) != Tzad::eOk)
        return {Taken::refused, localText("left a text that the drawing does not take")};
    return {Taken::changed, ""};
}

}  // namespace tzhost
