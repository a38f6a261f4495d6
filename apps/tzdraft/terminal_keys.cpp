#include "apps/tzdraft/terminal_keys.h"

#include <string>

namespace tzdraft {
namespace {

constexpr wchar_t const* kNothing = L"tz-nothing";

// Escape [ 1 ; MODIFIER ENDING: 2 is Shift, from 3 on Alt or Ctrl is among the modifiers.
struct Moving {
    wchar_t ending;
    wchar_t const* withShift;
    wchar_t const* withOthers;
};
constexpr Moving kMoving[] = {
    {L'A', L"ed-prev-history", L"ed-prev-history"},
    {L'B', L"ed-next-history", L"ed-next-history"},
    {L'C', L"ed-next-char", L"em-next-word"},
    {L'D', L"ed-prev-char", L"ed-prev-word"},
    {L'F', L"ed-move-to-end", L"ed-move-to-end"},
    {L'H', L"ed-move-to-beg", L"ed-move-to-beg"},
    {L'P', kNothing, kNothing},
    {L'Q', kNothing, kNothing},
    {L'R', kNothing, kNothing},
    {L'S', kNothing, kNothing},
};
constexpr int kShift = 2;
constexpr int kLastModifier = 8;

// Escape [ NUMBER ~, with a modifier or without.
constexpr int kLastNumber = 34;

wchar_t const* numbered(int number) {
    switch (number) {
    case 1:
    case 7: return L"ed-move-to-beg";
    case 3: return L"ed-delete-next-char";
    case 4:
    case 8: return L"ed-move-to-end";
    default: return kNothing;
    }
}

void bind(EditLine* line, std::wstring const& rest, wchar_t const* function) {
    el_wset(line, EL_BIND, (L"\033[" + rest).c_str(), function, nullptr);
}

unsigned char doNothing(EditLine* /*line*/, wint_t /*key*/) {
    return CC_NORM;
}

}  // namespace

void bindTerminalKeys(EditLine* line) {
    el_wset(line, EL_ADDFN, kNothing, L"nothing", &doNothing);
    for (int number = 1; number <= kLastNumber; ++number) {
        std::wstring const key = std::to_wstring(number);
        bind(line, key + L"~", numbered(number));
        for (int modifier = kShift; modifier <= kLastModifier; ++modifier)
            bind(line, key + L";" + std::to_wstring(modifier) + L"~", numbered(number));
    }
    for (Moving const& each : kMoving) {
        for (int modifier = kShift; modifier <= kLastModifier; ++modifier)
            bind(line, L"1;" + std::to_wstring(modifier) + each.ending,
                 modifier == kShift ? each.withShift : each.withOthers);
    }
}

}  // namespace tzdraft
