// What the control words of text do.

#include <algorithm>

#include "host/rtf/document.h"

namespace tzhost {

namespace {

constexpr int kStackMark = 1234;
constexpr int kMostScalar = 0x10FFFF;
constexpr int kHalf = 0x10000;

}  // namespace

void RtfDocument::setToggle(RtfToken const& token, int field) {
    state_.set(static_cast<RtfField>(field), token.valueOr(1) != 0 ? 1 : 0);
}

void RtfDocument::setNumber(RtfToken const& token, int field) {
    int const usual = static_cast<RtfField>(field) == RtfField::substitutes ? 1 : 0;
    state_.set(static_cast<RtfField>(field), token.valueOr(usual));
}

void RtfDocument::setOff(RtfToken const&, int field) {
    state_.set(static_cast<RtfField>(field), 0);
}

// The same words tell of other scripts, too, which have the look of any text here.
void RtfDocument::setWide(RtfToken const& token, int field) {
    if (state_.get(RtfField::isWide) == 1)
        state_.set(static_cast<RtfField>(field), token.valueOr(1));
}

void RtfDocument::setDestination(RtfToken const&, int destination) {
    state_.set(RtfField::destination, destination);
}

void RtfDocument::beginListText(RtfToken const&, int) {
    state_.set(RtfField::inListText, 1);
}

// A table that is there twice goes on, but for that of the colours, whose numbers are places.
void RtfDocument::beginTable(RtfToken const&, int table) {
    if (table == kColorTable) colors_.clear();
    forgetTables();
    state_.set(RtfField::destination, table);
}

void RtfDocument::dropPicture(RtfToken const&, int) {
    ++result_.pictures;
    state_.set(RtfField::destination, kSkipped);
}

void RtfDocument::dropNote(RtfToken const&, int) {
    ++result_.notes;
    state_.set(RtfField::destination, kSkipped);
}

void RtfDocument::dropHeader(RtfToken const&, int) {
    ++result_.headers;
    state_.set(RtfField::destination, kSkipped);
}

void RtfDocument::putNamed(RtfToken const&, int character) {
    putCharacter(static_cast<wchar_t>(character));
}

void RtfDocument::putBlanks(RtfToken const&, int count) {
    putText(std::string_view("  ").substr(0, static_cast<std::size_t>(count)));
}

// Some documents have numbers above 0x7FFF as negative ones, some as they are.
void RtfDocument::putUnicode(RtfToken const& token, int) {
    substitutes_ = std::max(0, state_.get(RtfField::substitutes));
    int const number = token.value < 0 ? token.value + kHalf : token.value;
    if (number > 0 && number <= kMostScalar) putCharacter(static_cast<wchar_t>(number));
}

void RtfDocument::putTab(RtfToken const&, int) {
    if (run().isHidden) return;
    beginContent();
    writer_.setLook(run().plainLook);
    writer_.tab();
}

void RtfDocument::putLine(RtfToken const&, int) {
    if (run().isHidden) return;
    beginContent();
    writer_.setLook(run().plainLook);
    writer_.line();
}

// In a table the row is the paragraph.
void RtfDocument::endParagraph(RtfToken const&, int) {
    isAfterInnerEnd_ = state_.get(RtfField::inTable) != 0;
    if (isAfterInnerEnd_) return;
    isAfterCell_ = false;
    writer_.endParagraph(paragraphOf(run().settings), run().plainLook);
}

// The end of a page, column or section.
void RtfDocument::breakParagraph(RtfToken const& token, int argument) {
    if (writer_.hasContent()) endParagraph(token, argument);
}

void RtfDocument::endCell(RtfToken const&, int) {
    isAfterInnerEnd_ = false;
    if (isAfterCell_) putCellTab();
    isAfterCell_ = true;
}

// Of a table in a cell, whose cells and rows are like paragraphs of the cell.
void RtfDocument::endInnerCell(RtfToken const&, int) {
    isAfterInnerEnd_ = true;
}

// The columns are tab stops where the cells but the first begin.
void RtfDocument::endRow(RtfToken const&, int) {
    isAfterCell_ = isAfterInnerEnd_ = false;
    DialectParagraph row = paragraphOf({0, 0, rowTabs_});
    if (!row.tabs.empty()) row.tabs.pop_back();
    writer_.endParagraph(row, run().plainLook);
}

void RtfDocument::beginRow(RtfToken const&, int) {
    rowTabs_ = RtfTabLists::kEmpty;
}

void RtfDocument::addCell(RtfToken const& token, int) {
    rowTabs_ = tabs_.withStop(rowTabs_, token.value);
}

void RtfDocument::addTab(RtfToken const& token, int) {
    state_.set(RtfField::tabs, tabs_.withStop(state_.get(RtfField::tabs), token.value));
}

// The number of a list item keeps the style of its paragraph.
void RtfDocument::resetParagraph(RtfToken const&, int) {
    for (std::size_t i = kRtfLookFields; i < kRtfStyleFields; ++i)
        state_.set(static_cast<RtfField>(i), kRtfUnset);
    if (state_.get(RtfField::inListText) != 0) return;
    state_.set(RtfField::paragraphStyle, kRtfUnset);
    state_.set(RtfField::inTable, 0);
}

void RtfDocument::resetLook(RtfToken const&, int) {
    for (std::size_t i = 0; i < kRtfLookFields; ++i)
        state_.set(static_cast<RtfField>(i), kRtfUnset);
    state_.set(RtfField::characterStyle, kRtfUnset);
    for (RtfField const wide : {RtfField::wideSize, RtfField::wideBold, RtfField::wideItalic})
        state_.set(wide, kRtfUnset);
}

// Text above and below the line stands on it. The mark of a stack stays one.
void RtfDocument::shiftBaseline(RtfToken const& token, int) {
    bool const isMark = token.text == "dn" && token.value == kStackMark;
    state_.set(RtfField::stackMark, isMark ? 1 : 0);
    if (!isMark) writer_.endStack();
}

void RtfDocument::setCodePage(RtfToken const& token, int page) {
    int const named = page != 0 ? page : token.value;
    codePage_ = RtfByteText::isKnown(named) ? named : 0;
    forgetTables();
}

void RtfDocument::setDefaultFont(RtfToken const& token, int) {
    defaultFont_ = token.value;
    run_.isKnown = false;
}

}  // namespace tzhost
