#pragma once

// Writes rich text in the words that the module's reader knows: a font and a colour table of what
// is used, each paragraph after a `\pard` with its indents and tabs, and each run of a look of its
// own in a group that opens with the words of that look.
//
//   DialectWriter writer;
//   DialectLook bold;
//   bold.isBold = true;
//   writer.setLook(bold);
//   writer.ascii("NOTE");
//   writer.endParagraph({}, bold);
//   std::string document = writer.finish({});

#include <cstddef>
#include <deque>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace tzhost {

// A face as the font table names it.
struct DialectFont {
    std::wstring name;
    int charset = 1;
    int family = 0;  // a multiple of 16, as in a pitch and family
    int pitch = 0;
};

// Numbers are those that the writer gave.
struct DialectLook {
    int font = -1;  // -1: that of the text style
    int size = 0;   // half-points; 0: that of the text style
    int color = -1;
    bool isBold = false;
    bool isItalic = false;
    bool isUnderlined = false;
    bool isStruck = false;
    bool isStackMark = false;

    bool operator==(DialectLook const&) const = default;
};

// Lengths in twips.
struct DialectParagraph {
    int firstIndent = 0;
    int leftIndent = 0;
    std::vector<int> tabs;
};

class DialectWriter {
public:
    // Of a document of about so many bytes.
    explicit DialectWriter(std::size_t size = 0) { body_.reserve(size); }

    // The number of a new font, and of a colour, 0x00BBGGRR, which has one number however often it
    // is asked for.
    [[nodiscard]] int addFont(DialectFont const& font);
    [[nodiscard]] int colorNumber(unsigned int rgb);

    // The look of what follows.
    void setLook(DialectLook const& look);
    // Printable ASCII without braces and backslashes.
    void ascii(std::string_view text);
    // A character of Unicode; no control character.
    void character(wchar_t c);
    void tab();
    void line();
    // Ends what a stack's mark began, for a reader to which all text after such a mark belongs to
    // it.
    void endStack();

    // Whether the paragraph has anything in it.
    [[nodiscard]] bool hasContent() const { return hasContent_; }
    // The look is that of the mark. It is of no use at the end of the document.
    void endParagraph(DialectParagraph const& paragraph, DialectLook const& mark);

    // The whole document. A paragraph that was not ended is one of these settings.
    [[nodiscard]] std::string finish(DialectParagraph const& last);

private:
    static constexpr std::size_t kNowhere = static_cast<std::size_t>(-1);

    void closeLook();
    void writeWord(char const* word);
    void writeMark();
    void protectStackSign();
    void insertSettings(DialectParagraph const& paragraph);
    [[nodiscard]] std::string head() const;

    struct Font {
        DialectFont face;
        bool isUsed = false;  // the table has it
    };
    std::deque<Font> fonts_;  // no copy while it grows: a document may have a million
    std::vector<unsigned int> colors_;
    std::map<unsigned int, int> colorNumbers_;
    std::string body_;
    std::size_t paragraphStart_ = 0;
    std::size_t stackSignAt_ = kNowhere;  // of an "S" that may be taken for a stack's sign
    DialectLook look_;                    // the one in force; a group is open when it has words
    DialectLook startLook_;      // that of the group that is open where the paragraph starts
    bool hasLeftStart_ = false;  // that group ends within the paragraph
    DialectLook mark_;           // of a paragraph that has ended
    bool hasMark_ = false;       // its end is not yet written
    bool hasContent_ = false;
    bool isInStack_ = false;
};

}  // namespace tzhost
