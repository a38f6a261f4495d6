#include <cmath>
#include <numbers>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/database/symbol_name.h"
#include "host/fonts/machine_fonts.h"
#include "host/layout/glyph_run.h"
#include "tz/db/extensions.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

// Everything that STYLE asks, so that a cancel leaves the style alone.
struct StyleAnswers {
    TzString font;
    TzString bigFont;
    bool bold = false;
    bool italic = false;
    int charset = 0;
    int pitchAndFamily = 0;
    double height = 0;
    double widthFactor = 1;
    double oblique = 0;
    bool backward = false;
    bool upsideDown = false;
    bool vertical = false;
    bool annotative = false;
};

constexpr int kBackward = 2;
constexpr int kUpsideDown = 4;

bool isFontFile(TzString const& font) {
    return font.length() >= 4 && font.right(4).compareNoCase(L".shx") == 0;
}

StyleAnswers presentValues(TzDbTextStyleTableRecord const& style) {
    StyleAnswers values;
    TzString typeface;
    if (style.font(typeface, values.bold, values.italic, values.charset, values.pitchAndFamily) ==
        Tzad::eOk) {
        values.font = typeface;
    }
    if (values.font.isEmpty()) values.font = style.fileName();
    values.bigFont = style.bigFontFileName();
    values.height = style.textSize();
    values.widthFactor = style.xScale();
    values.oblique = style.obliquingAngle();
    values.backward = (style.flagBits() & kBackward) != 0;
    values.upsideDown = (style.flagBits() & kUpsideDown) != 0;
    values.vertical = style.isVertical();
    if (auto* const extension = tzrxQuery<TzDbAnnotativeObjectPE>(&style)) {
        values.annotative = extension->annotative(&style);
    }
    return values;
}

template <class Value>
bool take(Answer<Value> const& answer, Value& place) {
    if (answer.asked == Asked::given) place = answer.value;
    return !answer.isCancelled();
}

// A face whose texts will be shown in another is likely a slip. Vertical faces have an "@" before
// their name.
void tellMissing(TzString const& face) {
    TzString const name = face.left(1) == L"@" ? face.mid(1) : face;
    if (!name.isEmpty() && tzhost::englishNameOf(name.str()).empty()) {
        tzutPrintf(
            localText(L"\nThe typeface \"%ls\" is not installed; another stands in for it.\n"),
            name.kwszPtr());
    }
}

// "a.shx,b.shx" names a font file with its big font.
bool askFont(StyleAnswers& values) {
    TzString shown = values.font;
    if (isFontFile(shown) && !values.bigFont.isEmpty()) shown += L"," + values.bigFont;
    TzString answer;
    if (!take(askText(localText(L"Font file or typeface"), shown), answer)) return false;
    int const comma = answer.find(L',');
    bool const isPair = comma >= 0 && isFontFile(answer.left(comma));
    values.font = isPair ? answer.left(comma) : answer;
    values.bigFont = isPair ? answer.mid(comma + 1) : TzString();
    if (isFontFile(values.font)) return true;
    tellMissing(values.font);
    return take(askYesNo(localText(L"Bold?"), values.bold), values.bold) &&
           take(askYesNo(localText(L"Italic?"), values.italic), values.italic);
}

// An angle within half a turn; beyond the most letters would be endless.
bool askSlant(double& radians) {
    auto const ask = [&] {
        Answer<double> angle = askAngle(localText(L"Obliquing angle"), radians);
        angle.value = std::remainder(angle.value, 2.0 * std::numbers::pi);
        return angle;
    };
    auto const canBe = [](Answer<double> const& angle) {
        bool const isUsable = tzhost::usableSlant(angle.value) == angle.value;
        if (!isUsable) tellProblem(localText(L"Letters slant by -85 to 85 degrees."));
        return isUsable;
    };
    return take(askUntil(ask, canBe), radians);
}

bool askAll(StyleAnswers& values) {
    return askFont(values) &&
           take(askSize(localText(L"Text height, 0 for any"), values.height, Zero::taken),
                values.height) &&
           take(askSize(localText(L"Width factor"), values.widthFactor, Zero::refused),
                values.widthFactor) &&
           askSlant(values.oblique) &&
           take(askYesNo(localText(L"Backward?"), values.backward), values.backward) &&
           take(askYesNo(localText(L"Upside-down?"), values.upsideDown), values.upsideDown) &&
           take(askYesNo(localText(L"Vertical?"), values.vertical), values.vertical) &&
           take(askYesNo(localText(L"Annotative?"), values.annotative), values.annotative);
}

// The first refusal, or eOk.
Tzad::ErrorStatus write(TzDbTextStyleTableRecord& style, StyleAnswers const& values) {
    bool const isFile = isFontFile(values.font);
    int const bits = (values.backward ? kBackward : 0) | (values.upsideDown ? kUpsideDown : 0);
    Tzad::ErrorStatus const statuses[] = {
        style.setFont(isFile ? L"" : values.font.kwszPtr(), values.bold, values.italic,
                      values.charset, values.pitchAndFamily),
        style.setFileName(isFile ? values.font.kwszPtr() : L""),
        style.setBigFontFileName(values.bigFont),
        style.setTextSize(values.height),
        style.setXScale(values.widthFactor),
        style.setObliquingAngle(values.oblique),
        style.setFlagBits(bits),
        style.setIsVertical(values.vertical),
    };
    for (Tzad::ErrorStatus const status : statuses) {
        if (status != Tzad::eOk) return status;
    }
    auto* const extension = tzrxQuery<TzDbAnnotativeObjectPE>(&style);
    return extension ? extension->setAnnotative(&style, values.annotative) : Tzad::eOk;
}

TzDbObjectId styleNamed(TzString const& name) {
    TzDbTextStyleTable* table = nullptr;
    if (ProgramSession::current().drawing().getTextStyleTable(table, TzDb::kForWrite) != Tzad::eOk)
        return {};
    Opened<TzDbTextStyleTable> const opened(table);
    return findOrAdd<TzDbTextStyleTableRecord>(table, name);
}

// The values to begin with: those of the style of that name, if there is one.
StyleAnswers startingValues(TzString const& name) {
    TzDbTextStyleTable* table = nullptr;
    TzDbObjectId id;
    if (ProgramSession::current().drawing().getTextStyleTable(table, TzDb::kForRead) != Tzad::eOk)
        return {};
    Opened<TzDbTextStyleTable> const opened(table);
    StyleAnswers values;
    values.font = L"txt.shx";
    if (table->getIdAt(name, id) != Tzad::eOk) return values;
    Opened<TzDbTextStyleTableRecord> const style(id, TzDb::kForRead);
    return style ? presentValues(*style.get()) : StyleAnswers();
}

bool canBeStyle(Answer<TzString> const& name) {
    bool const isName = tzhost::isSymbolName(name.value.str());
    if (!isName) tellNoName(localText(L"\"%ls\" cannot be the name of a text style."), name.value);
    return isName;
}

TzString presentName() {
    Opened<TzDbTextStyleTableRecord> const present(ProgramSession::current().drawing().textstyle(),
                                                   TzDb::kForRead);
    return present ? TzString(present->getName()) : TzString();
}

}  // namespace

void styleCommand() {
    Answer<TzString> const named = askUntil(
        [] {
            return askListedName(localText(L"Text style name or [?]"), offerStyles(),
                                 ProgramSession::current().drawing().textStyleTableId(),
                                 presentName());
        },
        canBeStyle);
    if (named.asked != Asked::given) return;
    TzString const& name = named.value;
    StyleAnswers values = startingValues(name);
    if (!askAll(values)) return;
    TzDbObjectId const id = styleNamed(name);
    Opened<TzDbTextStyleTableRecord> const style(id, TzDb::kForWrite);
    if (!style) return;
    if (write(*style.get(), values) != Tzad::eOk) {
        tellProblem(localText(L"One of these values cannot be kept; the others are."));
    }
    if (ProgramSession::current().drawing().setTextstyle(id) == Tzad::eOk) {
        tzutPrintf(localText(L"\n\"%ls\" is now the current text style.\n"), name.kwszPtr());
    }
}

}  // namespace tzdraft
