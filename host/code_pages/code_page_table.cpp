#include "host/code_pages/code_page_table.h"

#include <algorithm>
#include <iterator>

#include "host/settings/variables.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {

struct CharsetRow {
    Charset charset;
    int codePage;
};

// Character sets and their pages, searched in both directions. Set 1, the system's, is not listed.
constexpr CharsetRow kCharsets[] = {
    {kAnsiCharset, 1252},    {kSymbolCharset, 42},       {kMacCharset, 10000},
    {kShiftJisCharset, 932}, {kHangulCharset, 949},      {kJohabCharset, 1361},
    {kGb2312Charset, 936},   {kChineseBig5Charset, 950}, {kGreekCharset, 1253},
    {kTurkishCharset, 1254}, {kVietnameseCharset, 1258}, {kHebrewCharset, 1255},
    {kArabicCharset, 1256},  {kBalticCharset, 1257},     {kRussianCharset, 1251},
    {kThaiCharset, 874},     {kEastEuropeCharset, 1250}, {kOemCharset, 437},
};

struct LeadBytes {
    int codePage;
    unsigned char first;
    unsigned char last;
};

constexpr LeadBytes kLeadBytes[] = {
    {932, 0x81, 0x9F}, {932, 0xE0, 0xFC},  {936, 0x81, 0xFE},  {949, 0x81, 0xFE},
    {950, 0x81, 0xFE}, {1361, 0x84, 0xD3}, {1361, 0xD8, 0xDE}, {1361, 0xE0, 0xF9},
};

struct NameRow {
    int codePage;
    char const* name;
};

// Pages that have another name in iconv than "CP" and their number.
constexpr NameRow kNames[] = {
    {10000, "MACINTOSH"}, {20127, "ASCII"},   {20866, "KOI8-R"},
    {21866, "KOI8-U"},    {54936, "GB18030"}, {51932, "EUC-JP"},
};

// Pages 28591 to 28606 are the parts 1 to 16 of ISO 8859.
constexpr int kFirstIsoPage = 28591;
constexpr int kLastIsoPage = 28606;

}  // namespace

int systemCodePage() {
    // This runs at every change of a font, so the variable is looked up once, and its text is not
    // copied.
    static VariableDefinition const& row = *findVariable(L"SYSCODEPAGE");
    auto const& name = std::get<std::wstring>(Variables::instance().get(row));
    std::size_t const underscore = name.rfind(L'_');
    int page = 0;
    for (std::size_t i = underscore == name.npos ? 0 : underscore + 1; i < name.size(); ++i) {
        if (name[i] < L'0' || name[i] > L'9' || page > kUtf8CodePage) return kDefaultCodePage;
        page = page * 10 + (name[i] - L'0');
    }
    return page == 0 ? kDefaultCodePage : page;
}

int codePageOf(Charset charset) {
    auto const row = std::find_if(std::begin(kCharsets), std::end(kCharsets),
                                  [=](CharsetRow const& each) { return each.charset == charset; });
    return row == std::end(kCharsets) ? 0 : row->codePage;
}

Charset charsetOf(int codePage) {
    auto const row =
        std::find_if(std::begin(kCharsets), std::end(kCharsets),
                     [=](CharsetRow const& each) { return each.codePage == codePage; });
    return row == std::end(kCharsets) ? kAnsiCharset : row->charset;
}

bool isLeadByte(int codePage, unsigned char byte) {
    return std::any_of(std::begin(kLeadBytes), std::end(kLeadBytes), [=](LeadBytes const& row) {
        return row.codePage == codePage && byte >= row.first && byte <= row.last;
    });
}

bool hasLeadBytes(int codePage) {
    return std::any_of(std::begin(kLeadBytes), std::end(kLeadBytes),
                       [=](LeadBytes const& row) { return row.codePage == codePage; });
}

std::string iconvNameOf(int codePage) {
    auto const row = std::find_if(std::begin(kNames), std::end(kNames),
                                  [=](NameRow const& each) { return each.codePage == codePage; });
    if (row != std::end(kNames)) return row->name;
    if (codePage >= kFirstIsoPage && codePage <= kLastIsoPage) {
        return "ISO-8859-" + std::to_string(codePage - kFirstIsoPage + 1);
    }
    return "CP" + std::to_string(codePage);
}

}  // namespace tzhost
