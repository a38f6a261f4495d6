#include "host/drawing_file/members.h"

#include <algorithm>
#include <iterator>

#include "host/database/geometry.h"
#include "host/text/local_text.h"
#include "tz/db/mtext.h"

namespace tzhost::drawingfile {
namespace {

bool isPlain(TextEditorColumns const& columns) {
    return columns.columnType == 0 && !columns.autoHeight && columns.columnCount == 0 &&
           columns.columnWidth == 0.0 && columns.columnGutter == 0.0 && !columns.flowReversed &&
           columns.heights.isEmpty();
}

bool isPlain(MTextBackground const& background) {
    MTextBackground const fresh;
    return !background.fill && background.color == fresh.color && background.scale == fresh.scale &&
           background.transparency == fresh.transparency && !background.useBackgroundColor;
}

// In the order of the justifications.
constexpr char const* kJustifications[TzDbText::kJustifications] = {
    "Left", "Center", "Right", "TL", "TC", "TR", "ML", "MC", "MR", "BL", "BC", "BR",
};
constexpr char const* kJustificationForm =
    forLocalText("Left, Center, Right, TL, TC, TR, ML, MC, MR, BL, BC or BR");

void readJustification(MemberReader& members, TzDbText::Justification& justification) {
    JsonValue const* const member = members.takeOf("justification", JsonKind::text);
    if (!member) return;
    auto const at = std::find(std::begin(kJustifications), std::end(kJustifications), member->text);
    if (at == std::end(kJustifications)) {
        return members.complain("justification", localText("is no justification, expected ") +
                                                     localText(kJustificationForm));
    }
    justification = static_cast<TzDbText::Justification>(at - kJustifications);
}

}  // namespace

// The alignment point decides where a justified text lies; without one its position is it.
void describePlace(MemberReader& members, TextImp& values) {
    members.point("position", values.alignmentPoint);
    readJustification(members, values.justification);
    TzGePoint3d alignment = values.alignmentPoint;
    members.point("alignment", alignment);
    if (values.justification != TzDbText::kLeft) values.alignmentPoint = alignment;
}

void describePlace(MemberWriter& members, TextImp& values) {
    members.point("position", values.position());
    if (values.justification == TzDbText::kLeft) return;
    writeText(members.begin("justification"), kJustifications[values.justification]);
    members.point("alignment", values.alignmentPoint);
}

void describeHeights(MemberReader& members, TextEditorColumns& columns) {
    std::vector<double> heights;
    members.numbers("heights", heights, Range::size);
    columns.heights.removeAll();
    for (double const height : heights)
        columns.heights.append(height);
    members.flag("flowReversed", columns.flowReversed);
}

// Few texts have these values, so only those that differ from the defaults are written.
void describeHeights(MemberWriter& members, TextEditorColumns& columns) {
    if (!columns.heights.isEmpty()) {
        members.numbers("heights", {columns.heights.begin(), columns.heights.end()}, Range::size);
    }
    if (columns.flowReversed) members.flag("flowReversed", true);
}

void describeColumns(MemberReader& members, MTextImp& values) {
    TextEditorColumns columns;
    members.nested("columns", [&](MemberReader& inner) { describe(inner, columns); });
    if (!isPlain(columns)) values.columns = std::make_unique<TextEditorColumns>(columns);
}

void describeColumns(MemberWriter& members, MTextImp& values) {
    TextEditorColumns columns = values.columns ? *values.columns : TextEditorColumns();
    members.nested("columns", [&](MemberWriter& inner) { describe(inner, columns); });
}

void describeBackground(MemberReader& members, MTextImp& values) {
    MTextBackground background;
    members.nested("background", [&](MemberReader& inner) { describe(inner, background); });
    if (!isPlain(background)) values.background = std::make_unique<MTextBackground>(background);
}

void describeBackground(MemberWriter& members, MTextImp& values) {
    MTextBackground background = values.background ? *values.background : MTextBackground();
    members.nested("background", [&](MemberWriter& inner) { describe(inner, background); });
}

void describeTransparency(MemberReader& members, TzCmTransparency& transparency) {
    constexpr int kMost = 90;
    int percent = transparency.percent();
    members.whole("transparency", percent, WholeRange{0, kMost});
    (void)transparency.setPercent(percent);  // in range
}

void describeTransparency(MemberWriter& members, TzCmTransparency& transparency) {
    members.number("transparency", transparency.percent());
}

void describeLines(MemberReader& members, DefinitionImp& values) {
    JsonValue const* const member = members.take("mtext");
    if (!member || member->kind == JsonKind::null) return;
    auto lines = std::make_unique<TzDbMText>();
    MTextImp& inner = valuesOf<MTextImp>(*lines);
    inner.style = values.style;
    members.nested("mtext", [&](MemberReader& each) { describeOwn(each, inner); });
    values.lines = std::move(lines);
}

void describeLines(MemberWriter& members, DefinitionImp& values) {
    if (!values.lines) return members.null("mtext");
    MTextImp& inner = valuesOf<MTextImp>(*values.lines);
    members.nested("mtext", [&](MemberWriter& each) { describeOwn(each, inner); });
}

void settleAxes(MemberReader& members, MTextImp& values) {
    if (values.direction.isParallelTo(values.normal)) {
        members.complain("direction",
                         localText("is parallel to the normal, expected another direction"));
    } else {
        values.direction = perpendicularTo(values.normal, values.direction);
    }
}

void settleAxes(MemberWriter& /*members*/, MTextImp& /*values*/) {}

}  // namespace tzhost::drawingfile
