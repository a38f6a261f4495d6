#include "host/editors/edited_rtf.h"

#include <algorithm>
#include <utility>

#include "host/command_line/command_line.h"
#include "host/editors/returned_stacks.h"
#include "host/editors/sent_rtf.h"
#include "host/rtf/normaliser.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "tz/text/string.h"

namespace tzhost {
namespace {

constexpr std::string_view kDocumentStart = "{\\rtf";
constexpr std::string_view kBlanks = " \t\r\n";

bool holdsText(CMTextEditorInterface& state) {
    CStdStrW markup;
    state.GetMTextString(markup);
    return !markup.empty();
}

std::wstring documentOf(CMTextEditorInterface& state) {
    CStdStrW document;
    state.GetRTFString(document);
    return document;
}

// Takes the next line off the text, without its end and the blanks around it.
std::string_view takeLine(std::string_view& text) {
    std::string_view line = text.substr(0, text.find('\n'));
    text.remove_prefix(std::min(text.size(), line.size() + 1));
    line.remove_prefix(std::min(line.size(), line.find_first_not_of(kBlanks)));
    return line.substr(0, line.find_last_not_of(kBlanks) + 1);
}

// What goes back in the place of faces and colours. A face that was sent has the numbers that it
// had, whatever the program made of them. Text that looked like the whole entity goes on doing so
// when that gets another style or colour.
class Replacements : public RtfReplacements {
public:
    Replacements(CMTextEditorInterface const& before, std::string_view sent)
        : fonts_(fontsOf(sent)), style_(before.GetStyle()), color_(before.GetInitialColor()),
          newColor_(color_) {}

    void setNew(CMTextEditorInterface const& after) {
        hasNewStyle_ = style_.compareNoCase(after.GetStyle().c_str()) != 0;
        newColor_ = after.GetInitialColor();
    }

    [[nodiscard]] DialectFont font(DialectFont const& font) const override;
    [[nodiscard]] unsigned int color(unsigned int rgb) const override;

private:
    std::vector<DialectFont> fonts_;
    TzString style_;
    unsigned int color_;
    unsigned int newColor_;
    bool hasNewStyle_ = false;
};

DialectFont Replacements::font(DialectFont const& font) const {
    DialectFont const* found = nullptr;
    for (DialectFont const& sent : fonts_) {
        if (TzString(sent.name).compareNoCase(font.name.c_str()) != 0) continue;
        if (!found || sent.charset == font.charset) found = &sent;
        if (sent.charset == font.charset) break;
    }
    if (!found) return font;
    if (hasNewStyle_ && found == &fonts_.front()) return {};
    return *found;
}

unsigned int Replacements::color(unsigned int rgb) const {
    unsigned int const meant = rgb == kShownWhite ? kWhite : rgb;
    return meant == color_ ? newColor_ : meant;
}

// What the normaliser left out, in one line.
void tellWhatIsLeftOut(NormalisedRtf const& rtf) {
    if (rtf.isComplete()) return;
    commandLine().say(TzString::formatted(localText(L"Left out: %d pictures, %d notes, %d headers "
                                                    L"and footers."),
                                          rtf.pictures, rtf.notes, rtf.headers)
                          .str());
}

std::string problemWith(DialogValue const& row) {
    return TzString::formatted(localText(L"left a value that %ls cannot have"), row.name).toUtf8();
}

}  // namespace

EditedRtf::EditedRtf(CMTextEditorInterface& state) : state_(state), isEmpty_(!holdsText(state)) {
    std::wstring document = documentOf(state);
    if (document.starts_with(L"{\\rtf"))
        sent_ = sentRtf(document);
    else
        failure_ = std::move(document);
}

TakenText EditedRtf::take(std::string_view left) {
    left = withoutByteOrderMark(left);
    DialogChanges changes = changes_;
    if (std::string problem = readChanges(left, changes); !problem.empty())
        return {Taken::refused, std::move(problem)};
    Replacements replacements(state_, sent_);
    changes.store(state_);
    replacements.setNew(state_);
    bool const isChanged = !left.empty() && takeDocument(left, replacements);
    return {isChanged || !changes.areNone() ? Taken::changed : Taken::unchanged, ""};
}

// Takes the lines before the document off; the problem with one of them, or nothing.
std::string EditedRtf::readChanges(std::string_view& left, DialogChanges& changes) const {
    while (!left.empty() && !left.starts_with(kDocumentStart)) {
        std::string_view const line = takeLine(left);
        if (line.empty()) continue;
        std::size_t const sign = line.find('=');
        DialogValue const* const row =
            sign == line.npos ? nullptr : findDialogValue(fromUtf8(line.substr(0, sign)));
        if (!row) return localText("left no rich text");
        DialogChange change = row->read(state_, fromUtf8(line.substr(sign + 1)));
        if (!change) return problemWith(*row);
        changes.add(std::move(change));
    }
    return "";
}

// False for a document that says what was sent; the state then keeps its text as it is.
bool EditedRtf::takeDocument(std::string_view left, RtfReplacements const& replacements) {
    NormalisedRtf const rtf = normaliseRtf(left, replacements);
    tellWhatIsLeftOut(rtf);
    std::string const document = withStacks(rtf.document);
    if (document == withStacks(normaliseRtf(sent_, replacements).document)) return false;
    state_.SetRTFString(fromUtf8(document));
    return true;
}

}  // namespace tzhost
