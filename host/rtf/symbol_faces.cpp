#include "host/rtf/symbol_faces.h"

#include "tz/text/string.h"

namespace tzhost {

namespace {

constexpr wchar_t kFirstLow = 0x20;
constexpr wchar_t kFirstHigh = 0xA0;

// The face Symbol from 0x20 to 0x7E and from 0xA0 to 0xFE; blanks at places of no character.
constexpr std::wstring_view kLow =
    L" !\u2200#\u2203%&\u220B()\u2217+,\u2212./0123456789:;<=>?"
    L"\u2245\u0391\u0392\u03A7\u0394\u0395\u03A6\u0393\u0397\u0399\u03D1\u039A\u039B\u039C\u039D\u039F"
    L"\u03A0\u0398\u03A1\u03A3\u03A4\u03A5\u03C2\u03A9\u039E\u03A8\u0396[\u2234]\u22A5_"
    L"\u203E\u03B1\u03B2\u03C7\u03B4\u03B5\u03C6\u03B3\u03B7\u03B9\u03D5\u03BA\u03BB\u03BC\u03BD\u03BF"
    L"\u03C0\u03B8\u03C1\u03C3\u03C4\u03C5\u03D6\u03C9\u03BE\u03C8\u03B6{|}\u223C";
constexpr std::wstring_view kHigh =
    L"\u20AC\u03D2\u2032\u2264\u2044\u221E\u0192\u2663\u2666\u2665\u2660\u2194\u2190\u2191\u2192\u2193"
    L"\u00B0\u00B1\u2033\u2265\u00D7\u221D\u2202\u2022\u00F7\u2260\u2261\u2248\u2026\u23D0\u23AF\u21B5"
    L"\u2135\u2111\u211C\u2118\u2297\u2295\u2205\u2229\u222A\u2283\u2287\u2284\u2282\u2286\u2208\u2209"
    L"\u2220\u2207\u00AE\u00A9\u2122\u220F\u221A\u22C5\u00AC\u2227\u2228\u21D4\u21D0\u21D1\u21D2\u21D3"
    L"\u25CA\u2329\u00AE\u00A9\u2122\u2211\u239B\u239C\u239D\u23A1\u23A2\u23A3\u23A7\u23A8\u23A9\u23AA"
    L" \u232A\u222B\u2320\u23AE\u2321\u239E\u239F\u23A0\u23A4\u23A5\u23A6\u23AB\u23AC\u23AD";
static_assert(kLow.size() == 0x7F - 0x20 && kHigh.size() == 0xFF - 0xA0);

struct PlaceRow {
    wchar_t place;
    wchar_t character;
};

// The bullets, boxes and arrows of the face Wingdings that lists are made with.
constexpr PlaceRow kWingdings[] = {
    {0x6C, 0x25CF}, {0x6E, 0x25A0}, {0x6F, 0x25A1}, {0x71, 0x2751}, {0x75, 0x25C6},
    {0x76, 0x2756}, {0xA1, 0x25CB}, {0xA7, 0x25AA}, {0xA8, 0x25FB}, {0xD8, 0x27A2},
    {0xDF, 0x2190}, {0xE0, 0x2192}, {0xFB, 0x2717}, {0xFC, 0x2713}, {0xFE, 0x2611},
};

struct FaceRow {
    wchar_t const* name;
    SymbolFace face;
};
constexpr FaceRow kFaces[] = {
    {L"Symbol", SymbolFace::symbol},
    {L"Wingdings", SymbolFace::wingdings},
};

wchar_t at(std::wstring_view part, wchar_t place, wchar_t other) {
    auto const index = static_cast<std::size_t>(place);
    return index < part.size() && part[index] != L' ' ? part[index] : other;
}

}  // namespace

SymbolFace symbolFaceOf(std::wstring_view name) {
    for (FaceRow const& row : kFaces) {
        if (TzString(name).compareNoCase(row.name) == 0) return row.face;
    }
    return SymbolFace::none;
}

wchar_t unicodeOf(SymbolFace face, wchar_t c) {
    if (face == SymbolFace::none || c < kFirstSymbol || c > kLastSymbol) return c;
    wchar_t const place = c - kFirstSymbol;
    if (face == SymbolFace::symbol) {
        if (place == kFirstLow) return L' ';
        return place < kFirstHigh ? at(kLow, place - kFirstLow, c)
                                  : at(kHigh, place - kFirstHigh, c);
    }
    for (PlaceRow const& row : kWingdings) {
        if (row.place == place) return row.character;
    }
    return c;
}

}  // namespace tzhost
