// Which charset a font serves, by the letters that it holds.

#include <array>
#include <map>
#include <memory>
#include <utility>

#include "host/code_pages/code_page_converter.h"
#include "host/code_pages/code_page_table.h"
#include "host/fonts/machine_catalogue.h"
#include "host/text/case_table.h"

namespace tzhost {

namespace {

struct Destroy {
    void operator()(FcCharSet* set) const { FcCharSetDestroy(set); }
};
using Letters = std::unique_ptr<FcCharSet, Destroy>;

// The charsets that are tried when a font lacks the letters of the system page, in this order.
constexpr std::array<Charset, 9> kTried{
    kShiftJisCharset, kHangulCharset, kGb2312Charset, kChineseBig5Charset, kRussianCharset,
    kGreekCharset,    kHebrewCharset, kArabicCharset, kThaiCharset,
};

// The pages with two bytes: lead and trail bytes of their first level, which every font of the
// script has. Rarer characters do not count.
struct Level {
    int codePage;
    int firstLead, lastLead;
    int firstTrail, lastTrail;
};
// clang-format off
constexpr std::array<Level, 6> kLevels{{
    {932, 0x82, 0x82, 0x9F, 0xF1}, // hiragana
    {932, 0x83, 0x83, 0x40, 0x96}, // katakana
    {932, 0x89, 0x97, 0x9F, 0xFC}, // level 1 of kanji, half of each row
    {936, 0xB0, 0xD6, 0xA1, 0xFE},
    {949, 0xB0, 0xC8, 0xA1, 0xFE},
    {950, 0xA4, 0xC5, 0xA1, 0xFE},
}};
// clang-format on

// Letters of Hebrew, Arabic and Thai, which have no case. The vowel marks of Hebrew and Arabic do
// not count.
bool isUncasedLetter(wchar_t c) {
    struct Range {
        wchar_t first, last;
    };
    constexpr std::array<Range, 4> kRanges{
        {{0x5D0, 0x5EA}, {0x621, 0x64A}, {0x671, 0x6D3}, {0xE01, 0xE4E}}};
    for (Range const& range : kRanges) {
        if (c >= range.first && c <= range.last) return true;
    }
    return false;
}

constexpr wchar_t kAfterLatin = 0x250;

enum class Latin { without, with };

void addBytes(FcCharSet& letters, int codePage, std::string_view bytes, Latin latin) {
    auto const text = decode(codePage, bytes);
    if (!text || text->size() != 1) return;
    wchar_t const c = text->front();
    bool const isLatin = c < kAfterLatin;
    bool const isLetter = lowerOf(c) != upperOf(c) || isUncasedLetter(c) || bytes.size() > 1;
    if (isLetter && (!isLatin || latin == Latin::with)) {
        FcCharSetAddChar(&letters, static_cast<FcChar32>(c));
    }
}

// The letters of a page. A font of one script need not hold the Latin letters that the page has
// too.
Letters lettersOf(int codePage, Latin latin) {
    Letters letters(FcCharSetCreate());
    if (!letters) throw std::bad_alloc();
    for (int byte = 0; byte < 0x100; ++byte) {
        if (isLeadByte(codePage, static_cast<unsigned char>(byte))) continue;
        addBytes(*letters, codePage, std::string(1, static_cast<char>(byte)), latin);
    }
    for (Level const& level : kLevels) {
        if (level.codePage != codePage) continue;
        for (int lead = level.firstLead; lead <= level.lastLead; ++lead) {
            for (int trail = level.firstTrail; trail <= level.lastTrail; ++trail) {
                std::string const bytes{static_cast<char>(lead), static_cast<char>(trail)};
                addBytes(*letters, codePage, bytes, latin);
            }
        }
    }
    return letters;
}

FcCharSet const& remembered(int codePage, Latin latin) {
    static std::map<std::pair<int, Latin>, Letters> pages;
    Letters& letters = pages[{codePage, latin}];
    if (!letters) letters = lettersOf(codePage, latin);
    return *letters;
}

bool holds(FontForm const& form, FcCharSet const& letters) {
    return form.characters != nullptr && FcCharSetIsSubset(&letters, form.characters) == FcTrue;
}

Charset findCharset(FontForm const& form, int systemPage) {
    if (holds(form, remembered(systemPage, Latin::with))) return kAnsiCharset;
    for (Charset const charset : kTried) {
        if (holds(form, remembered(codePageOf(charset), Latin::without))) return charset;
    }
    return kDefaultCharset;
}

}  // namespace

Charset charsetOf(FontForm const& form) {
    static std::map<std::pair<FontForm const*, int>, Charset> answers;
    std::pair const key(&form, systemCodePage());
    auto at = answers.find(key);
    if (at == answers.end()) at = answers.emplace(key, findCharset(form, key.second)).first;
    return at->second;
}

}  // namespace tzhost
