// The list of the drawing's text styles.

#include "module/host_calls/unit_converter.h"
#include "module/prompt/string_input.h"
#include "module/styles/style_rules.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/ed/print.h"
#include "tz/ed/selection.h"
#include "tz/mte/mtext_command.h"

namespace {

// Bits of a style's flags.
constexpr int kBackwardBit = 2;
constexpr int kUpsideDownBit = 4;

TzString quoted(wchar_t const* name) {
    return TzString::formatted(L"\"%ls\"", name ? name : L"");
}

void printText(unsigned id) {
    tzutPrintf(L"%ls", gStringTable[id].kwszPtr());
}

TzString modesOf(TzDbTextStyleTableRecord const& style) {
    TzString modes;
    if (style.flagBits() & kBackwardBit) modes += gStringTable[kText.backward] + L" ";
    if (style.flagBits() & kUpsideDownBit) modes += gStringTable[kText.upsideDown] + L" ";
    if (style.isVertical()) modes += gStringTable[kText.vertical] + L" ";
    return modes.isEmpty() ? gStringTable[kText.normal] : modes;
}

void printStyle(TzDbTextStyleTableRecord const& style) {
    tzutPrintf(gStringTable[kText.styleNameAndFont], quoted(style.getName()).kwszPtr(),
               style.fileName().kwszPtr());
    TzString const bigFont = style.bigFontFileName();
    if (!bigFont.isEmpty()) tzutPrintf(L", %ls", bigFont.kwszPtr());
    tzutPrintf(L"\n");
    CLinearUnitConverter const lengths(kLinearUnitsOfDrawing, kPrecisionOfDrawing);
    CLinearUnitConverter const factors(kDecimal, kPrecisionOfDrawing);
    CRadialUnitConverter const angles(kRadialUnitsOfDrawing, kPrecisionOfDrawing);
    tzutPrintf(gStringTable[kText.styleSizes], lengths.MapDoubleToUnit(style.textSize()).kwszPtr(),
               factors.MapDoubleToUnit(style.xScale()).kwszPtr(),
               angles.MapDoubleToUnit(style.obliquingAngle()).kwszPtr());
    tzutPrintf(gStringTable[kText.styleGeneration], modesOf(style).kwszPtr());
}

// How many styles a list showed, and how many it left out as another drawing's.
struct ListCounts {
    int shown = 0;
    int external = 0;
};

ListCounts printStyles(TzDbTextStyleTableIterator& walk, TzString const& pattern) {
    ListCounts counts;
    for (; !walk.done(); walk.step(true, true)) {
        EasyObject<TzDbTextStyleTableRecord> style;
        if (walk.getRecord(style.object, TzDb::kForRead) != Tzad::eOk) continue;
        TzString const name = style->getName();
        if (name.find(kExternalStyleMark) != -1) {
            ++counts.external;
        } else if (tzutWcMatchEx(name, pattern, true)) {
            printStyle(*style.object);
            ++counts.shown;
        }
    }
    return counts;
}

// Asks which styles to list; false when there is no answer.
bool askPattern(TzString& pattern) {
    CKeywordTable none;
    CTzsSymbolStringInput input(0, none, gStringTable[kText.stylePatternPrompt]);
    input.SetDefault(L"*");
    int const status = input.Prompt();
    if (status == statusNone) {
        pattern = input.GetDefault();
        return true;
    }
    pattern = input.GetInput();
    return status == statusNormal;
}

}  // namespace

void TzxMtextCommandBase::EnumerateStyles() {
    TzString pattern;
    if (!askPattern(pattern)) return;
    EasyTable<TzDbTextStyleTable> table;
    TzDbDatabase* database = tzdbHostApplicationServices()->workingDatabase();
    if (database->getTextStyleTable(table.object, TzDb::kForRead) != Tzad::eOk) return;
    EasyIterator<TzDbTextStyleTable, TzDbTextStyleTableIterator> walk;
    if (table->newIterator(walk.object, true, true) != Tzad::eOk) return;
    tzedTextScr();
    printText(kText.styleHeading);
    walk->start(true, true);
    ListCounts const counts = printStyles(*walk.object, pattern);
    if (counts.shown == 0) printText(kText.noStyleFound);
    if (counts.external > 0) tzutPrintf(gStringTable[kText.externalStyles], counts.external);
    tzutPrintf(gStringTable[kText.currentStyle], quoted(GetCurrentTextStyleName()).kwszPtr());
}
