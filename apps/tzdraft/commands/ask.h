#pragma once

#include <filesystem>

#include "host/command_line/command_line.h"
#include "tz/db/object_id.h"
#include "tz/ge/point3d.h"
#include "tz/text/string.h"

// The questions of the program's own commands, with their defaults shown as "<...>".
namespace tzdraft {

// `refused` is the answer of a script that the command has no use for.
enum class Asked { given, empty, cancelled, refused };

template <class Value>
struct Answer {
    Asked asked = Asked::cancelled;
    Value value{};

    [[nodiscard]] bool isCancelled() const { return asked == Asked::cancelled; }
};

// Asks again until the command has a use for the answer; `accepts` says what is wrong with it. A
// script is asked once: what follows may be the next command.
template <class Ask, class Accepts>
[[nodiscard]] auto askUntil(Ask ask, Accepts accepts) {
    for (;;) {
        auto answer = ask();
        if (answer.asked != Asked::given || accepts(answer)) return answer;
        answer.asked = Asked::refused;
        if (!tzhost::commandLine().isPerson()) return answer;
    }
}

// Without a default an empty answer is `empty`; with one it gives the default.
[[nodiscard]] Answer<TzString> askText(wchar_t const* question,
                                       TzString const& defaultText = TzString());
// The same for a name, which completion may be offered for (choices.h).
[[nodiscard]] Answer<TzString>
askName(wchar_t const* question, tzhost::Offer offer, TzString const& defaultName = TzString());
// The same for a name in a table of the drawing, whose names "?" lists before it asks again.
[[nodiscard]] Answer<TzString> askListedName(wchar_t const* question,
                                             tzhost::Offer const& offer,
                                             TzDbObjectId table,
                                             TzString const& defaultName = TzString());
// The name of a file. Completion looks for one without a slash in `home`.
[[nodiscard]] Answer<std::filesystem::path> askFile(wchar_t const* question,
                                                    TzString const& defaultFile = TzString(),
                                                    std::filesystem::path const& home = {});
// The global word of the keyword; the default is one of the words. `keywords` are the global words,
// blanks between them; their local text has the local ones in the same order, and those are shown.
[[nodiscard]] Answer<TzString>
askKeyword(wchar_t const* question, wchar_t const* keywords, wchar_t const* defaultWord = nullptr);
// Neither below 0 nor, where that is no use, 0 itself.
enum class Zero { taken, refused };
[[nodiscard]] Answer<double> askSize(wchar_t const* question, double defaultValue, Zero zero);
// A length above 0, also by a point from `base`, which may be null; without a default (0) an empty
// answer is `empty`.
[[nodiscard]] Answer<double>
askLength(wchar_t const* question, TzGePoint3d const* base, double defaultValue = 0);
// Radians.
[[nodiscard]] Answer<double> askAngle(wchar_t const* question, double defaultRadians);
[[nodiscard]] Answer<bool> askYesNo(wchar_t const* question, bool defaultYes);

// A point in user coordinates or, with `keywords` as askKeyword takes them, a global word in
// `word`. The default word is what the caller takes an empty answer for.
struct PointAnswer {
    Asked asked = Asked::cancelled;
    TzGePoint3d point;
    TzString word;

    [[nodiscard]] bool isWord() const { return !word.isEmpty(); }
};
[[nodiscard]] PointAnswer askPoint(wchar_t const* question,
                                   TzGePoint3d const* base,
                                   wchar_t const* keywords = nullptr,
                                   wchar_t const* defaultWord = nullptr);

// The same for a question that used to have no keywords: a person is shown the first of them, and a
// script nothing, so that its transcript stays.
[[nodiscard]] PointAnswer askPointOrMore(wchar_t const* question, wchar_t const* keywords);

}  // namespace tzdraft
