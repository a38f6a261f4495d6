#include <algorithm>
#include <string>

#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/color_text.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/commands/selected.h"
#include "apps/tzdraft/program_texts.h"
#include "host/command_line/point_input.h"
#include "tz/db/block_table.h"
#include "tz/db/extensions.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"
#include "tz/ed/print.h"
#include "tz/rx/class.h"

using tzhost::shownAngle;
using tzhost::shownDistance;

namespace tzdraft {
namespace {

// Kinds of entities that have a word in other languages, named as their classes are.
constexpr wchar_t const* kKinds[] = {
    forLocalText(L"Attribute"),      forLocalText(L"AttributeDefinition"),
    forLocalText(L"BlockReference"), forLocalText(L"Circle"),
    forLocalText(L"Line"),
};

// In the order of the justifications, of which the last nine are the attachments, counted from 1.
constexpr wchar_t const* kJustifications[TzDbText::kJustifications] = {
    forLocalText(L"left"),        forLocalText(L"centered"),      forLocalText(L"right"),
    forLocalText(L"top left"),    forLocalText(L"top center"),    forLocalText(L"top right"),
    forLocalText(L"middle left"), forLocalText(L"middle center"), forLocalText(L"middle right"),
    forLocalText(L"bottom left"), forLocalText(L"bottom center"), forLocalText(L"bottom right"),
};

TzString point(TzGePoint3d const& place) {
    return shownDistance(place.x) + L", " + shownDistance(place.y) + L", " + shownDistance(place.z);
}

TzString number(double value) {
    return TzString::formatted(L"%g", value);
}

// Of a record of one of the tables.
TzString nameOf(TzDbObjectId id) {
    Opened<TzDbSymbolTableRecord> const record(id, TzDb::kForRead);
    return record ? TzString(record->getName()) : TzString();
}

void row(wchar_t const* name, TzString const& value) {
    tzutPrintf(L"\n  %-16ls %ls", name, value.kwszPtr());
}

void listColumns(TzDbMText const& text) {
    if (text.columnType() == TzDbMText::kNoColumns) return;
    TextEditorColumns const columns = text.columns();
    bool const isStatic = columns.columnType == TzDbMText::kStaticColumns;
    // Of dynamic ones the text decides how many there are, and a drawing need not say it.
    TzString const count =
        columns.columnCount > 0 ? TzString::formatted(L", %d", columns.columnCount) : TzString();
    row(localText(L"columns"),
        TzString::formatted(
            localText(L"%ls%ls, width %ls, gutter %ls"),
            localText(isStatic ? forLocalText(L"static") : forLocalText(L"dynamic")),
            count.kwszPtr(), shownDistance(columns.columnWidth).kwszPtr(),
            shownDistance(columns.columnGutter).kwszPtr()));
}

void listBackground(TzDbMText const& text) {
    if (!text.backgroundFillOn()) return;
    std::wstring const color = text.useBackgroundColorOn() ? std::wstring(localText(L"as the page"))
                                                           : writeColor(text.backgroundFillColor());
    row(localText(L"background"),
        TzString::formatted(localText(L"colour %ls, scale %ls, transparency %d"), color.c_str(),
                            number(text.backgroundScaleFactor()).kwszPtr(),
                            static_cast<int>(text.backgroundTransparency().percent())));
}

// Each is told where it is so.
void listMarks(TzDbEntity const& text) {
    auto* const scaled = tzrxQuery<TzDbAnnotativeObjectPE>(&text);
    if (scaled && scaled->annotative(&text)) row(localText(L"annotative"), localText(L"yes"));
    auto* const turned = tzrxQuery<TzDbPaperOrientationPE>(&text);
    if (turned && turned->paperOrientation(&text))
        row(localText(L"upright"), localText(L"on the sheet"));
}

void listMText(TzDbMText const& text) {
    bool const isExact = text.lineSpacingStyle() == TzDb::kExactly;
    row(localText(L"location"), point(text.location()));
    row(localText(L"attachment"),
        localText(kJustifications[TzDbText::kRight + static_cast<int>(text.attachment())]));
    row(localText(L"style"), nameOf(text.textStyle()));
    row(localText(L"text height"), shownDistance(text.textHeight()));
    row(localText(L"rotation"), shownAngle(text.rotation()));
    row(localText(L"line spacing"),
        TzString::formatted(isExact ? localText(L"exactly %ls") : localText(L"at least %ls"),
                            number(text.lineSpacingFactor()).kwszPtr()));
    row(localText(L"width"),
        text.width() > 0 ? shownDistance(text.width()) : TzString(localText(L"no wrapping")));
    row(localText(L"measured"),
        shownDistance(text.actualWidth()) + L" x " + shownDistance(text.actualHeight()));
    TzArray<TzGePoint3d> corners;
    text.getBoundingPoints(corners);
    if (corners.length() == 4) {
        row(localText(L"upper left"), point(corners[0]));
        row(localText(L"lower right"), point(corners[3]));
    }
    listColumns(text);
    listBackground(text);
    listMarks(text);
    row(localText(L"contents"), text.contents());
}

void listText(TzDbText const& text) {
    row(localText(L"position"), point(text.position()));
    if (text.justification() != TzDbText::kLeft) {
        row(localText(L"justification"), localText(kJustifications[text.justification()]));
        row(localText(L"alignment point"), point(text.alignmentPoint()));
    }
    row(localText(L"style"), nameOf(text.textStyle()));
    row(localText(L"text height"), shownDistance(text.height()));
    row(localText(L"rotation"), shownAngle(text.rotation()));
    row(localText(L"width factor"), number(text.widthFactor()));
    row(localText(L"oblique"), shownAngle(text.oblique()));
    listMarks(text);
    row(localText(L"text"), text.textString());
}

// Of several lines, where these stand and what they say.
void listDefinition(TzDbAttributeDefinition const& definition) {
    row(localText(L"tag"), definition.tag());
    row(localText(L"prompt"), definition.prompt());
    TzDbMText const* const lines = definition.getMTextAttributeDefinitionConst();
    if (lines) {
        listMText(*lines);
    } else {
        listText(definition);
    }
}

void listAttribute(TzDbAttribute const& attribute) {
    row(localText(L"tag"), attribute.tag());
    listText(attribute);
}

void listLine(TzDbLine const& line) {
    row(localText(L"from"), point(line.startPoint()));
    row(localText(L"to"), point(line.endPoint()));
    row(localText(L"length"), shownDistance(line.startPoint().distanceTo(line.endPoint())));
}

void listCircle(TzDbCircle const& circle) {
    row(localText(L"center"), point(circle.center()));
    row(localText(L"radius"), shownDistance(circle.radius()));
}

void listReference(TzDbBlockReference const& reference) {
    row(localText(L"block"), nameOf(reference.blockTableRecord()));
    row(localText(L"position"), point(reference.position()));
    row(localText(L"scale"), number(reference.scale()));
    row(localText(L"rotation"), shownAngle(reference.rotation()));
    TzArray<TzDbObjectId> ids;
    reference.attributes(ids);
    for (TzDbObjectId const id : ids) {
        Opened<TzDbAttribute> const attribute(id, TzDb::kForRead);
        if (attribute) row(attribute->tag(), attribute->textString());
    }
}

// Tells about the entity when it is of the class; false when it is not.
template <class Entity>
bool listAs(TzDbEntity const& entity, void (*list)(Entity const&)) {
    auto const* const as = tzrxCast<Entity>(static_cast<TzRxObject const*>(&entity));
    if (as) list(*as);
    return as != nullptr;
}

// "TzDbLine" and so on: the name after the prefix is the drafter's word.
std::wstring kindOf(TzDbEntity const& entity) {
    std::wstring name = std::wstring(entity.isA()->name()).substr(4);
    for (wchar_t const* const each : kKinds) {
        if (name == each) return localText(each);
    }
    return name;
}

void listEntity(TzDbEntity const& entity) {
    tzutPrintf(localText(L"\n%ls  #%llX, layer \"%ls\""), kindOf(entity).c_str(),
               static_cast<unsigned long long>(entity.objectId().handle()),
               entity.layer().kwszPtr());
    if (!entity.color().isByLayer()) row(localText(L"colour"), writeColor(entity.color()));
    (void)(listAs(entity, listMText) || listAs(entity, listDefinition) ||
           listAs(entity, listAttribute) || listAs(entity, listText) || listAs(entity, listLine) ||
           listAs(entity, listCircle) || listAs(entity, listReference));
}

}  // namespace

void listCommand() {
    std::vector<TzDbObjectId> const ids = selectEntities(OnLockedLayers::included);
    for (TzDbObjectId const id : ids) {
        Opened<TzDbEntity> const entity(id, TzDb::kForRead);
        if (entity) listEntity(*entity.get());
    }
    if (!ids.empty()) tzutPrintf(L"\n");
}

}  // namespace tzdraft
