#include "apps/tzdraft/commands/ask.h"

#include <algorithm>

#include "apps/tzdraft/commands/name_list.h"
#include "apps/tzdraft/program_texts.h"
#include "apps/tzdraft/typed_file.h"
#include "host/command_line/command_line.h"
#include "host/command_line/keyword_list.h"
#include "host/runtime/words.h"
#include "host/settings/variables.h"
#include "host/text/utf8.h"
#include "tz/ed/prompts.h"
#include "tz/ed/units.h"
#include "tz/rx/status.h"

namespace tzdraft {
namespace {

constexpr int kDecimal = 2;
constexpr int kShownDecimals = 4;

// Bits of tzedInitGet.
constexpr int kNoZero = 2;
constexpr int kNoNegative = 4;

TzString withDefault(wchar_t const* question, TzString const& shown) {
    return TzString::formatted(L"\n%ls <%ls>: ", question, shown.kwszPtr());
}

// The words of a question in both languages.
class Words {
public:
    explicit Words(wchar_t const* globals) : globals_(globals), locals_(localText(globals)) {}

    // As tzedInitGet takes them.
    [[nodiscard]] TzString list() const {
        return globals_ == locals_ ? globals_ : locals_ + L" _" + globals_;
    }
    // "Question [Local/Words] <Word>: " on a line of its own; no default when it is null.
    [[nodiscard]] TzString prompt(wchar_t const* question, wchar_t const* defaultWord) const;
    // The same with the first word alone.
    [[nodiscard]] TzString promptWithFirst(wchar_t const* question) const;

private:
    [[nodiscard]] TzString localOf(TzString const& global) const;

    TzString globals_;
    TzString locals_;
};

// The word at the same place of the local list.
TzString Words::localOf(TzString const& global) const {
    auto const words = tzhost::KeywordList::parse(list().str());
    for (int index = 0; words && index < words->count(); ++index) {
        if (words->global(index) == global.str()) return TzString(words->local(index));
    }
    return global;
}

TzString Words::prompt(wchar_t const* question, wchar_t const* defaultWord) const {
    std::wstring bracket = locals_.str();
    std::replace(bracket.begin(), bracket.end(), L' ', L'/');
    TzString text =
        TzString::formatted(*question ? L"\n%ls [%ls]" : L"\n%ls[%ls]", question, bracket.c_str());
    if (defaultWord) text += TzString::formatted(L" <%ls>", localOf(defaultWord).kwszPtr());
    return text + L": ";
}

TzString Words::promptWithFirst(wchar_t const* question) const {
    std::wstring const words = locals_.str();
    return TzString::formatted(L"\n%ls [%ls]: ", question,
                               words.substr(0, words.find(L' ')).c_str());
}

// Asks until the host gives a value, an empty answer or a cancel.
template <class Ask>
Asked askUntilDecided(wchar_t const* keywords, Ask ask, int flags = 0) {
    for (;;) {
        (void)tzedInitGet(flags, keywords);  // the lists of this program are well-formed
        switch (ask()) {
        case Tzad::ePromptNormal:
        case Tzad::ePromptKeyword: return Asked::given;
        case Tzad::ePromptNone: return Asked::empty;
        case Tzad::ePromptCancel: return Asked::cancelled;
        default: break;
        }
    }
}

PointAnswer
askPointBy(TzString const& prompt, TzString const& keywordList, TzGePoint3d const* base) {
    double const from[3] = {base ? base->x : 0, base ? base->y : 0, base ? base->z : 0};
    double point[3] = {0, 0, 0};
    PointAnswer answer;
    bool isWord = false;
    answer.asked = askUntilDecided(keywordList, [&] {
        int const status = tzedGetPoint(base ? from : nullptr, prompt, point);
        isWord = status == Tzad::ePromptKeyword;
        return status;
    });
    if (isWord) (void)tzedGetInput(answer.word);  // an empty word matches none of the caller's
    answer.point = TzGePoint3d(point[0], point[1], point[2]);
    return answer;
}

}  // namespace

Answer<TzString> askText(wchar_t const* question, TzString const& defaultText) {
    return askName(question, {}, defaultText);
}

Answer<TzString>
askName(wchar_t const* question, tzhost::Offer offer, TzString const& defaultName) {
    TzString const prompt = defaultName.isEmpty() ? TzString::formatted(L"\n%ls: ", question)
                                                  : withDefault(question, defaultName);
    bool const isName = offer.kind == tzhost::Offer::Kind::names;  // with no blanks at its ends
    Answer<TzString> answer;
    answer.asked = askUntilDecided(nullptr, [&] {
        tzhost::commandLine().offer(offer);
        return tzedGetString(1, prompt, answer.value);
    });
    if (tzhost::commandLine().isPerson() && isName)
        answer.value = TzString(std::wstring(tzhost::withoutBlanksAround(answer.value.str())));
    if (answer.asked == Asked::given && answer.value.isEmpty()) {
        answer.value = defaultName;
        if (defaultName.isEmpty()) answer.asked = Asked::empty;
    }
    return answer;
}

Answer<TzString> askListedName(wchar_t const* question,
                               tzhost::Offer const& offer,
                               TzDbObjectId table,
                               TzString const& defaultName) {
    for (;;) {
        Answer<TzString> const answer = askName(question, offer, defaultName);
        if (answer.asked != Asked::given || answer.value != L"?") return answer;
        listNames(table);
    }
}

Answer<std::filesystem::path>
askFile(wchar_t const* question, TzString const& defaultFile, std::filesystem::path const& home) {
    tzhost::Offer const offer{tzhost::Offer::Kind::files, {}, tzhost::fromUtf8(home.string())};
    Answer<TzString> const file = askName(question, offer, defaultFile);
    if (tzhost::commandLine().isPerson()) return {file.asked, fileTyped(file.value.str())};
    return {file.asked, std::filesystem::path(file.value.toUtf8())};
}

Answer<TzString>
askKeyword(wchar_t const* question, wchar_t const* keywords, wchar_t const* defaultWord) {
    Words const words(keywords);
    TzString const prompt = words.prompt(question, defaultWord);
    Answer<TzString> answer;
    answer.asked =
        askUntilDecided(words.list(), [&] { return tzedGetKword(prompt, answer.value); });
    if (answer.asked == Asked::empty && defaultWord) answer = {Asked::given, defaultWord};
    return answer;
}

Answer<double> askSize(wchar_t const* question, double defaultValue, Zero zero) {
    TzString shown;
    (void)tzdbRToS(defaultValue, kDecimal, kShownDecimals, shown);
    TzString const prompt = withDefault(question, shown);
    Answer<double> answer;
    answer.asked = askUntilDecided(
        nullptr, [&] { return tzedGetReal(prompt, &answer.value); },
        zero == Zero::refused ? kNoZero | kNoNegative : kNoNegative);
    if (answer.asked == Asked::empty) answer = {Asked::given, defaultValue};
    return answer;
}

Answer<double> askLength(wchar_t const* question, TzGePoint3d const* base, double defaultValue) {
    TzString shown;
    (void)tzdbRToS(defaultValue, kDecimal, kShownDecimals, shown);
    TzString const prompt =
        defaultValue > 0 ? withDefault(question, shown) : TzString::formatted(L"\n%ls: ", question);
    double const from[3] = {base ? base->x : 0, base ? base->y : 0, base ? base->z : 0};
    Answer<double> answer;
    answer.asked = askUntilDecided(
        nullptr, [&] { return tzedGetDist(base ? from : nullptr, prompt, &answer.value); },
        kNoZero | kNoNegative);
    if (answer.asked == Asked::empty && defaultValue > 0) answer = {Asked::given, defaultValue};
    return answer;
}

Answer<double> askAngle(wchar_t const* question, double defaultRadians) {
    // In the units in which an answer is read.
    int const units = static_cast<int>(tzhost::Variables::instance().number(L"AUNITS"));
    TzString shown;
    (void)tzdbAngToS(defaultRadians, units, kShownDecimals, shown);
    TzString const prompt = withDefault(question, shown);
    Answer<double> answer;
    answer.asked =
        askUntilDecided(nullptr, [&] { return tzedGetAngle(nullptr, prompt, &answer.value); });
    if (answer.asked == Asked::empty) answer = {Asked::given, defaultRadians};
    return answer;
}

Answer<bool> askYesNo(wchar_t const* question, bool defaultYes) {
    Answer<TzString> const word =
        askKeyword(question, forLocalText(L"Yes No"), defaultYes ? L"Yes" : L"No");
    return {word.asked, word.value == L"Yes"};
}

PointAnswer askPoint(wchar_t const* question,
                     TzGePoint3d const* base,
                     wchar_t const* keywords,
                     wchar_t const* defaultWord) {
    if (!keywords) return askPointBy(TzString::formatted(L"\n%ls: ", question), TzString(), base);
    Words const words(keywords);
    return askPointBy(words.prompt(question, defaultWord), words.list(), base);
}

PointAnswer askPointOrMore(wchar_t const* question, wchar_t const* keywords) {
    Words const words(keywords);
    TzString const prompt = tzhost::commandLine().isPerson()
                                ? words.promptWithFirst(question)
                                : TzString::formatted(L"\n%ls: ", question);
    return askPointBy(prompt, words.list(), nullptr);
}

}  // namespace tzdraft
