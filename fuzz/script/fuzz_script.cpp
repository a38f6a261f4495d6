// Any bytes as a script: questions of every kind and editors take turns at it. Each question uses
// up a line, so a script ends after as many questions as it has lines; what is shown grows with it.
#include <algorithm>
#include <cstdint>
#include <cstdlib>

#include "host/command_line/command_line.h"
#include "host/command_line/script_source.h"
#include "tz/ed/prompts.h"

static void ask(unsigned turn) {
    double value[3] = {};
    TzString text;
    (void)tzedInitGet(static_cast<int>(turn & 0x87), L"Breite alIgnment _Width Height");
    switch (turn % 7) {
    case 0: (void)tzedGetPoint(nullptr, L"?", value); break;
    case 1: (void)tzedGetDist(turn % 2 != 0 ? value : nullptr, L"?", value); break;
    case 2: (void)tzedGetAngle(value, L"?", value); break;
    case 3: (void)tzedGetReal(L"?", value); break;
    case 4: (void)tzedGetKword(L"?", text); break;
    case 5: (void)tzedGetString(1, L"?", text); break;
    default: (void)tzhost::commandLine().takeEditorBlock(); break;
    }
}

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size == 0) return 0;
    std::string const script(data + 1, data + size);
    tzhost::ScriptSource source(script);
    std::size_t shown = 0;
    tzhost::commandLine().reset();
    tzhost::commandLine().setSource(&source);
    tzhost::commandLine().setScreen(
        [&](tzhost::Shown, std::wstring_view text) { shown += text.size(); });
    auto const lines = static_cast<unsigned>(std::count(script.begin(), script.end(), '\n'));
    for (unsigned i = 0; i <= 2 * lines + 14; ++i)
        ask(data[0] + i);
    if (source.next({}).kind != tzhost::Answer::Kind::end) std::abort();
    // A control character shows as up to eight characters.
    if (shown > 8 * script.size() + 200 * (lines + 15)) std::abort();
    tzhost::commandLine().reset();
    return 0;
}
