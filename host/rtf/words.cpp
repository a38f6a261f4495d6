#include "host/rtf/words.h"

#include <algorithm>
#include <array>
#include <iterator>

namespace tzhost {

namespace {

constexpr int of(RtfField field) {
    return static_cast<int>(field);
}

constexpr std::size_t kLetters = 'z' - 'a' + 1;

}  // namespace

// A row for each word, in alphabetical order.
struct RtfWords::Table {
    using Document = RtfDocument;
    static constexpr Row kRows[] = {
        {"ab", &Document::setWide, of(RtfField::wideBold)},
        {"afs", &Document::setWide, of(RtfField::wideSize)},
        {"aftncn", &Document::setDestination, Document::kSkipped},
        {"aftnsep", &Document::setDestination, Document::kSkipped},
        {"aftnsepc", &Document::setDestination, Document::kSkipped},
        {"ai", &Document::setWide, of(RtfField::wideItalic)},
        {"annotation", &Document::dropNote, 0},
        {"ansicpg", &Document::setCodePage, 0},
        {"b", &Document::setToggle, of(RtfField::bold)},
        {"bullet", &Document::putNamed, 0x2022},
        {"caps", &Document::setToggle, of(RtfField::caps)},
        {"cell", &Document::endCell, 0},
        {"cellx", &Document::addCell, 0},
        {"cf", &Document::setNumber, of(RtfField::color)},
        {"colortbl", &Document::beginTable, Document::kColorTable},
        {"column", &Document::breakParagraph, 0},
        {"cs", &Document::setNumber, of(RtfField::characterStyle)},
        {"datafield", &Document::setDestination, Document::kSkipped},
        {"dbch", &Document::setToggle, of(RtfField::isWide)},
        {"deff", &Document::setDefaultFont, 0},
        {"deleted", &Document::setToggle, of(RtfField::hidden)},
        {"dn", &Document::shiftBaseline, 0},
        {"do", &Document::dropPicture, 0},
        {"emdash", &Document::putNamed, 0x2014},
        {"emspace", &Document::putBlanks, 2},
        {"endash", &Document::putNamed, 0x2013},
        {"enspace", &Document::putBlanks, 1},
        {"f", &Document::setNumber, of(RtfField::font)},
        {"fi", &Document::setNumber, of(RtfField::firstIndent)},
        {"filetbl", &Document::setDestination, Document::kSkipped},
        {"fldinst", &Document::setDestination, Document::kSkipped},
        {"fldrslt", &Document::setDestination, Document::kText},
        {"fonttbl", &Document::beginTable, Document::kFontTable},
        {"footer", &Document::dropHeader, 0},
        {"footerf", &Document::dropHeader, 0},
        {"footerl", &Document::dropHeader, 0},
        {"footerr", &Document::dropHeader, 0},
        {"footnote", &Document::dropNote, 0},
        {"fs", &Document::setNumber, of(RtfField::size)},
        {"ftncn", &Document::setDestination, Document::kSkipped},
        {"ftnsep", &Document::setDestination, Document::kSkipped},
        {"ftnsepc", &Document::setDestination, Document::kSkipped},
        {"header", &Document::dropHeader, 0},
        {"headerf", &Document::dropHeader, 0},
        {"headerl", &Document::dropHeader, 0},
        {"headerr", &Document::dropHeader, 0},
        {"hich", &Document::setOff, of(RtfField::isWide)},
        {"i", &Document::setToggle, of(RtfField::italic)},
        {"info", &Document::setDestination, Document::kSkipped},
        {"intbl", &Document::setToggle, of(RtfField::inTable)},
        {"lbr", &Document::putLine, 0},
        {"ldblquote", &Document::putNamed, 0x201C},
        {"li", &Document::setNumber, of(RtfField::leftIndent)},
        {"line", &Document::putLine, 0},
        {"listname", &Document::setDestination, Document::kSkipped},
        {"listtext", &Document::beginListText, 0},
        {"loch", &Document::setOff, of(RtfField::isWide)},
        {"lquote", &Document::putNamed, 0x2018},
        {"ltrch", &Document::setOff, of(RtfField::isWide)},
        {"ltrmark", &Document::putNamed, 0x200E},
        {"mac", &Document::setCodePage, 10000},
        {"mmathPict", &Document::setDestination, Document::kSkipped},
        {"nestcell", &Document::endInnerCell, 0},
        {"nestrow", &Document::endInnerCell, 0},
        {"nesttableprops", &Document::setDestination, Document::kText},
        {"nonesttables", &Document::setDestination, Document::kSkipped},
        {"nonshppict", &Document::setDestination, Document::kSkipped},
        {"page", &Document::breakParagraph, 0},
        {"par", &Document::endParagraph, 0},
        {"pard", &Document::resetParagraph, 0},
        {"pc", &Document::setCodePage, 437},
        {"pca", &Document::setCodePage, 850},
        {"pict", &Document::dropPicture, 0},
        {"plain", &Document::resetLook, 0},
        {"pntext", &Document::beginListText, 0},
        {"private", &Document::setDestination, Document::kSkipped},
        {"qmspace", &Document::putBlanks, 1},
        {"rdblquote", &Document::putNamed, 0x201D},
        {"result", &Document::setDestination, Document::kText},
        {"revtbl", &Document::setDestination, Document::kSkipped},
        {"row", &Document::endRow, 0},
        {"rquote", &Document::putNamed, 0x2019},
        {"rtlch", &Document::setOff, of(RtfField::isWide)},
        {"rtlmark", &Document::putNamed, 0x200F},
        {"rxe", &Document::setDestination, Document::kSkipped},
        {"s", &Document::setNumber, of(RtfField::paragraphStyle)},
        {"sect", &Document::breakParagraph, 0},
        {"shpinst", &Document::dropPicture, 0},
        {"shppict", &Document::setDestination, Document::kText},
        {"shprslt", &Document::setDestination, Document::kSkipped},
        {"strike", &Document::setToggle, of(RtfField::strike)},
        {"striked", &Document::setToggle, of(RtfField::strike)},
        {"stylesheet", &Document::beginTable, Document::kStyleSheet},
        {"tab", &Document::putTab, 0},
        {"tc", &Document::setDestination, Document::kSkipped},
        {"tcn", &Document::setDestination, Document::kSkipped},
        {"template", &Document::setDestination, Document::kSkipped},
        {"themedata", &Document::setDestination, Document::kSkipped},
        {"trowd", &Document::beginRow, 0},
        {"tx", &Document::addTab, 0},
        {"u", &Document::putUnicode, 0},
        {"uc", &Document::setNumber, of(RtfField::substitutes)},
        {"ul", &Document::setToggle, of(RtfField::underline)},
        {"uld", &Document::setToggle, of(RtfField::underline)},
        {"uldash", &Document::setToggle, of(RtfField::underline)},
        {"uldashd", &Document::setToggle, of(RtfField::underline)},
        {"uldashdd", &Document::setToggle, of(RtfField::underline)},
        {"uldb", &Document::setToggle, of(RtfField::underline)},
        {"ulhair", &Document::setToggle, of(RtfField::underline)},
        {"ulhwave", &Document::setToggle, of(RtfField::underline)},
        {"ulldash", &Document::setToggle, of(RtfField::underline)},
        {"ulnone", &Document::setOff, of(RtfField::underline)},
        {"ulth", &Document::setToggle, of(RtfField::underline)},
        {"ulthd", &Document::setToggle, of(RtfField::underline)},
        {"ulthdash", &Document::setToggle, of(RtfField::underline)},
        {"ulthdashd", &Document::setToggle, of(RtfField::underline)},
        {"ulthdashdd", &Document::setToggle, of(RtfField::underline)},
        {"ulthldash", &Document::setToggle, of(RtfField::underline)},
        {"ululdbwave", &Document::setToggle, of(RtfField::underline)},
        {"ulw", &Document::setToggle, of(RtfField::underline)},
        {"ulwave", &Document::setToggle, of(RtfField::underline)},
        {"up", &Document::shiftBaseline, 0},
        {"upr", &Document::setDestination, Document::kBothForms},
        {"v", &Document::setToggle, of(RtfField::hidden)},
        {"xe", &Document::setDestination, Document::kSkipped},
        {"zwj", &Document::putNamed, 0x200D},
        {"zwnj", &Document::putNamed, 0x200C},
    };
};

RtfWords::Row const* RtfWords::find(std::string_view word) {
    static constexpr auto const& kRows = Table::kRows;
    static_assert(std::is_sorted(std::begin(kRows), std::end(kRows),
                                 [](Row const& a, Row const& b) { return a.word < b.word; }));
    // The first row of each letter or after it, and one place more for the end of all.
    static constexpr auto kFirsts = [] {
        std::array<Row const*, kLetters + 1> firsts{};
        for (std::size_t letter = 0; letter <= kLetters; ++letter) {
            firsts[letter] = std::find_if(std::begin(kRows), std::end(kRows), [=](Row const& row) {
                return static_cast<std::size_t>(row.word.front() - 'a') >= letter;
            });
        }
        return firsts;
    }();
    if (word.front() < 'a' || word.front() > 'z') return nullptr;
    auto const letter = static_cast<std::size_t>(word.front() - 'a');
    auto const* const end = kFirsts[letter + 1];
    auto const* const row =
        std::find_if(kFirsts[letter], end, [=](Row const& each) { return each.word == word; });
    return row == end ? nullptr : row;
}

bool RtfWords::Row::isSetting() const {
    return handler == &RtfDocument::setToggle || handler == &RtfDocument::setNumber ||
           handler == &RtfDocument::setOff || handler == &RtfDocument::addTab;
}

bool RtfWords::isCharacter(std::string_view word) {
    Row const* const row = find(word);
    return row &&
           (row->handler == &RtfDocument::putNamed || row->handler == &RtfDocument::putBlanks);
}

bool RtfWords::beginsStyle(RtfToken const& token) {
    return token.text == "s" || token.text == "cs";
}

}  // namespace tzhost
