#include "bench/markup/texts.h"

namespace tzbench {

namespace {

constexpr wchar_t kPlain[] = L"a run of text that no code interrupts, it";
constexpr std::size_t kLongName = 60;

// A change of the look every 40 characters.
std::wstring denseUnit(std::initializer_list<wchar_t const*> changes) {
    std::wstring unit;
    for (wchar_t const* const change : changes)
        unit += std::wstring(change) + kPlain;
    return unit;
}

}  // namespace

std::span<TextKind const> textKinds() {
    static std::wstring const longName(kLongName, L'n');
    // clang-format off
    static TextKind const kinds[] = {
        {"plainMarkup", Sort::plain, Way::toRtf, L"", kPlain, L""},
        {"plainRtf", Sort::plain, Way::toMtext, L"", kPlain, L""},
        {"denseMarkup", Sort::dense, Way::toRtf, L"",
        denseUnit({L"\\L", L"\\l", L"\\H2x;", L"\\H.5x;", L"\\O", L"\\o"}), L""},
        {"denseRtf", Sort::dense, Way::toMtext, L"",
        denseUnit({L"\\ul ", L"\\ul0 ", L"\\fs56 ", L"\\fs28 ", L"\\b ", L"\\b0 "}), L""},
        {"nestedMarkup", Sort::other, Way::toRtf, L"", L"{a", L""},
        {"nestedRtf", Sort::other, Way::toMtext, L"{\\rtf1 ", L"{\\b a", L""},
        {"fontsOfMarkup", Sort::entries, Way::toRtf, L"", L"\\fFont #|b0|i0|c0|p0;a", L""},
        {"fontsOfRtf", Sort::entries, Way::toMtext, L"{\\fonttbl", L"{\\f#\\fcharset0 Font #;}",
        L"}\\f1 a"},
        {"fontsOfHighNumbers", Sort::entries, Way::toMtext, L"{\\fonttbl",
        L"{\\f#\\fcharset0 Font #;}", L"}\\f2000000001 a", 2000000000},
        {"pairsOfFiles", Sort::other, Way::toRtf, L"", L"\\Fqa,qb|c0;x", L""},
        {"colorsOfMarkup", Sort::entries, Way::toRtf, L"", L"\\c#;a", L""},
        {"colorsOfRtf", Sort::other, Way::toMtext, L"{\\colortbl", L"\\red#\\green1\\blue2;",
        L"}\\cf1 a"},
        {"paragraphs", Sort::other, Way::toMtext, L"", L"\\pard\\li#\\tx# a", L""},
        {"paragraphsWithoutText", Sort::other, Way::toMtext, L"", L"\\pard", L""},
        {"stacks", Sort::other, Way::toRtf, L"", L"\\S", L""},
        {"fontToggles", Sort::growing, Way::toMtext, L"{\\fonttbl{\\f1 " + longName + L";}}",
        L"\\f1 a\\f2 b\\f1\\b c\\b0 d", L""},
    };
    // clang-format on
    return kinds;
}

std::wstring textOf(TextKind const& kind, std::size_t size) {
    std::wstring text = kind.head;
    text.reserve(size + kind.unit.size() * 4 + kind.tail.size());
    for (long number = kind.first; text.size() < size; ++number) {
        std::wstring const digits = std::to_wstring(number);
        for (wchar_t const c : kind.unit) {
            if (c == L'#')
                text += digits;
            else
                text += c;
        }
    }
    return text += kind.tail;
}

TextStart startOfTexts() {
    TextStart start;
    start.font = {L"Liberation Sans", false, false, kAnsiCharset, 34, {}};
    return start;
}

std::wstring converted(ConversionSession& session, Way way, std::wstring const& text) {
    if (way == Way::toRtf) return session.toRtf(text).rtf;
    return session.toMarkup(text).markup;
}

}  // namespace tzbench
