#include <optional>
#include <string>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/page/page_plan.h"
#include "host/page/page_text.h"

namespace tzdraft {
namespace {

// A word that stands for no value: that of drawings and scripts, and that of the program's
// language.
struct NoValue {
    char const* word;
    wchar_t const* shown;
};
constexpr NoValue kFit{"fit", forLocalText(L"fit")};
constexpr NoValue kAll{"all", forLocalText(L"all")};

// Whether an answer is the second of the words, or the first with the mark of global words.
bool isShownOrGlobal(NoValue const& nothing, std::string const& answer) {
    TzString const text = TzString::fromUtf8(answer);
    TzString const global = TzString::fromUtf8(std::string("_") + nothing.word);
    return text.compareNoCase(localText(nothing.shown)) == 0 || text.compareNoCase(global) == 0;
}

// Asks for a text that `read` makes a value of. False when none was given.
template <class Value, class Read>
bool askRead(wchar_t const* question,
             std::string const& present,
             char const* expected,
             Value& value,
             Read read) {
    auto const accepts = [&](Answer<TzString> const& answer) {
        auto const found = read(answer.value.toUtf8());
        if (found) {
            value = *found;
        } else {
            tellProblem(localText(L"That is not what is asked for, expected %ls."),
                        TzString::fromUtf8(localText(expected)).kwszPtr());
        }
        return found.has_value();
    };
    auto const ask = [&] { return askText(question, TzString::fromUtf8(present)); };
    return askUntil(ask, accepts).asked == Asked::given;
}

// The same for a value that there may not be; `read` takes the first word of `nothing` for none.
template <class Value, class Read>
bool askReadOr(NoValue const& nothing,
               wchar_t const* question,
               char const* expected,
               std::optional<Value>& value,
               Read read) {
    std::string const shown = TzString(localText(nothing.shown)).toUtf8();
    return askRead(question, value ? nameOf(*value) : shown, expected, value,
                   [&](std::string const& answer) {
                       return read(isShownOrGlobal(nothing, answer) ? nothing.word : answer);
                   });
}

bool liesOnItsSide(tzhost::Page const& page) {
    if (page.paper.name != tzhost::PaperName::custom) return page.landscape;
    return page.paper.width >= page.paper.height;
}

bool askOrientation(tzhost::Page& page) {
    Answer<TzString> const word =
        askKeyword(localText(L"Orientation"), forLocalText(L"Portrait Landscape"),
                   liesOnItsSide(page) ? L"Landscape" : L"Portrait");
    if (word.isCancelled()) return false;
    page.landscape = word.value == L"Landscape";
    page.paper = tzhost::turned(page.paper, page.landscape);
    return true;
}

bool askScale(tzhost::Page& page) {
    return askReadOr(kFit, localText(L"Scale, N:M or fit"),
                     forLocalText("N:M with numbers above 0, or fit"), page.scale,
                     tzhost::readScaleOrFit);
}

bool askMargin(tzhost::Page& page) {
    return askRead(localText(L"Margin in millimetres"), tzhost::plainText(page.margin),
                   forLocalText("a number, 0 or more, that leaves something of the paper"),
                   page.margin, [&](std::string const& text) {
                       tzhost::Page tried = page;
                       auto const margin = tzhost::readPlainNumber(text);
                       tried.margin = margin.value_or(-1.0);
                       bool const isGood = tried.margin >= 0.0 && tzhost::hasRoom(tried);
                       return isGood ? margin : std::nullopt;
                   });
}

}  // namespace

// What was answered is kept once all is answered.
void pageCommand() {
    tzhost::Drawing& drawing = ProgramSession::current().drawing();
    tzhost::DrawingSettings settings = drawing.settings();
    tzhost::Page page = settings.page.value_or(tzhost::Page());
    bool const isAnswered = askRead(localText(L"Paper, such as A3 or 420x297"), nameOf(page.paper),
                                    tzhost::kPapers, page.paper, tzhost::readPaper) &&
                            askOrientation(page) && askScale(page) &&
                            askRead(localText(L"What a drawing unit is"), nameOf(page.unit),
                                    tzhost::kUnits, page.unit, tzhost::readUnit) &&
                            askMargin(page) &&
                            askReadOr(kAll, localText(L"Window X1,Y1,X2,Y2 or all"),
                                      forLocalText("two opposite corners X1,Y1,X2,Y2, or all"),
                                      page.window, tzhost::readWindowOrAll);
    if (!isAnswered) return;
    if (auto const problem = tzhost::problemOf(page)) {
        tellProblem(localText(L"The page stays as it was: %ls."),
                    TzString::fromUtf8(*problem).kwszPtr());
        return;
    }
    settings.page = page;
    drawing.setSettings(settings);
}

}  // namespace tzdraft
