#pragma once

// Follows a document token by token: what holds where, which groups are text, and what of it goes
// to the writer.

#include <cstdint>
#include <string_view>
#include <unordered_map>

#include "host/rtf/byte_text.h"
#include "host/rtf/color_table.h"
#include "host/rtf/dialect_writer.h"
#include "host/rtf/font_table.h"
#include "host/rtf/normaliser.h"
#include "host/rtf/state.h"
#include "host/rtf/style_sheet.h"
#include "host/rtf/symbol_faces.h"
#include "host/rtf/tab_lists.h"
#include "host/rtf/tokens.h"

namespace tzhost {

class RtfDocument {
public:
    // Of about so many bytes. Text that names no size has the usual one, in half-points; 0 is that
    // of the text style.
    RtfDocument(std::size_t bytes, int usualSize, RtfReplacements const& replacements)
        : writer_(bytes), replacements_(replacements), usualSize_(usualSize) {}

    void take(RtfToken const& token);
    [[nodiscard]] NormalisedRtf finish();

private:
    friend struct RtfWords;

    // What stands in a group.
    enum Destination {
        kText,
        kSkipped,
        kFontTable,
        kFont,
        kColorTable,
        kStyleSheet,
        kStyle,
        kBothForms,  // a text twice, of which the form in Unicode is read
        kOneForm,
    };
    struct Settings {
        int firstIndent = 0;
        int leftIndent = 0;
        int tabs = RtfTabLists::kEmpty;
    };
    // What the state means for text.
    struct Run {
        std::uint64_t changes = 0;  // of the state when it was found
        bool isKnown = false;
        DialectLook look;
        DialectLook plainLook;  // for symbols that are characters of any face
        SymbolFace symbols = SymbolFace::none;
        int page = 0;
        bool isHidden = false;
        bool isCapitals = false;
        Settings settings;
    };
    struct KeptFont {
        int number = kRtfUnset;
        bool isKnown = false;
        int written = -1;
        SymbolFace symbols = SymbolFace::none;
        int page = 0;
    };
    struct KeptStyle {
        int number = kRtfUnset;
        bool isKnown = false;
        RtfStyleValues values{};
    };

    // Groups and tokens.
    [[nodiscard]] int destination() const { return state_.get(RtfField::destination); }
    [[nodiscard]] bool isInFonts() const;
    [[nodiscard]] bool skips(RtfToken const& token);
    void onOpen();
    void onClose();
    void onWord(RtfToken const& token);
    void onSymbol(char symbol);
    void onText(std::string_view text);
    void onByte(unsigned char byte);
    void endBytes();

    // Tables, in document_tables.cpp.
    void beginEntry(Destination entry);
    void endEntry();
    void takeFontWord(RtfToken const& token);
    void takeStyleWord(RtfToken const& token);
    void takeTableText(std::string_view text);

    // Text and its look, in document_text.cpp.
    [[nodiscard]] int knownPage(int page) const;
    [[nodiscard]] RtfStyleValues const& styleOf(RtfStyleKind kind);
    [[nodiscard]] int valueOf(RtfField field);
    [[nodiscard]] int valueOf(RtfField field, RtfField wide);
    [[nodiscard]] int addFont(DialectFont const& font);
    [[nodiscard]] KeptFont keptFont(int number);
    [[nodiscard]] DialectLook lookInForce();
    [[nodiscard]] Run const& run();
    [[nodiscard]] DialectParagraph paragraphOf(Settings const& settings) const;
    void forgetTables();
    void beginContent();
    void putCellTab();
    void putText(std::string_view text);
    void putCharacters(std::wstring_view text);
    void putCharacter(wchar_t c);
    void putScalar(wchar_t c);

    // What the words do, in document_words.cpp.
    void setToggle(RtfToken const& token, int field);
    void setNumber(RtfToken const& token, int field);
    void setOff(RtfToken const& token, int field);
    void setWide(RtfToken const& token, int field);
    void setDestination(RtfToken const& token, int destination);
    void beginTable(RtfToken const& token, int table);
    void beginListText(RtfToken const& token, int argument);
    void dropPicture(RtfToken const& token, int argument);
    void dropNote(RtfToken const& token, int argument);
    void dropHeader(RtfToken const& token, int argument);
    void putNamed(RtfToken const& token, int character);
    void putBlanks(RtfToken const& token, int count);
    void putUnicode(RtfToken const& token, int argument);
    void putTab(RtfToken const& token, int argument);
    void putLine(RtfToken const& token, int argument);
    void endParagraph(RtfToken const& token, int argument);
    void breakParagraph(RtfToken const& token, int argument);
    void endCell(RtfToken const& token, int argument);
    void endInnerCell(RtfToken const& token, int argument);
    void endRow(RtfToken const& token, int argument);
    void beginRow(RtfToken const& token, int argument);
    void addCell(RtfToken const& token, int argument);
    void addTab(RtfToken const& token, int argument);
    void resetParagraph(RtfToken const& token, int argument);
    void resetLook(RtfToken const& token, int argument);
    void shiftBaseline(RtfToken const& token, int argument);
    void setCodePage(RtfToken const& token, int page);
    void setDefaultFont(RtfToken const& token, int argument);

    DialectWriter writer_;
    RtfState state_;
    RtfTabLists tabs_;
    RtfFontTable fonts_;
    RtfColorTable colors_;
    RtfStyleSheet styles_;
    RtfByteText bytes_;
    NormalisedRtf result_;

    RtfReplacements const& replacements_;
    int usualSize_;
    int codePage_ = 0;  // of the document; 0: the system's
    int defaultFont_ = kRtfUnset;
    bool isStarred_ = false;        // a `\*` was just read
    int substitutes_ = 0;           // characters to come that stand for the last `\u`
    wchar_t highSurrogate_ = 0;     // waits for its other half
    std::uint32_t entryDepth_ = 0;  // of the group of a font or style; 0: none is open
    int styleNumber_ = kRtfUnset;   // of the style whose entry is open
    int styleBase_ = kRtfUnset;
    RtfStyleKind styleKind_ = RtfStyleKind::paragraph;

    bool isAfterCell_ = false;      // what follows is in another cell
    bool isAfterInnerEnd_ = false;  // what follows is in another paragraph of the cell
    int rowTabs_ = RtfTabLists::kEmpty;
    Settings last_;  // of the last text

    std::unordered_map<int, int> writtenFonts_;  // numbers of the writer
    Run run_;
    KeptFont font_;
    KeptStyle paragraphStyle_;
    KeptStyle characterStyle_;
};

}  // namespace tzhost
