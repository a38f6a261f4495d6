#include "apps/tzdraft/commands/text_command.h"

#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/settings/variables.h"
#include "tz/db/host_services.h"
#include "tz/db/symbol_table.h"

namespace tzdraft {
namespace {

constexpr wchar_t const* kWords =
    forLocalText(L"Justify Left Center Right Middle TL TC TR ML MC MR BL BC BR");
constexpr wchar_t const* kJustifyWords =
    forLocalText(L"Left Center Right Middle TL TC TR ML MC MR BL BC BR");

struct WordRow {
    wchar_t const* word;
    TzDbText::Justification justification;
};

constexpr WordRow kRows[] = {
    {L"Left", TzDbText::kLeft},       {L"Center", TzDbText::kCenter},
    {L"Right", TzDbText::kRight},     {L"Middle", TzDbText::kMiddleCenter},
    {L"TL", TzDbText::kTopLeft},      {L"TC", TzDbText::kTopCenter},
    {L"TR", TzDbText::kTopRight},     {L"ML", TzDbText::kMiddleLeft},
    {L"MC", TzDbText::kMiddleCenter}, {L"MR", TzDbText::kMiddleRight},
    {L"BL", TzDbText::kBottomLeft},   {L"BC", TzDbText::kBottomCenter},
    {L"BR", TzDbText::kBottomRight},
};

// By a word of the point's question or, after "Justify", of one more. False after a cancel.
bool justify(TzString word, TzDbText::Justification& justification) {
    if (word == L"Justify") {
        Answer<TzString> const answer =
            askKeyword(localText(L"Justification"), kJustifyWords, L"Left");
        if (answer.isCancelled()) return false;
        word = answer.value;
    }
    for (WordRow const& row : kRows) {
        if (word == row.word) justification = row.justification;
    }
    return true;
}

// The start point, or the alignment point after the keyword that says what lies there. It is in
// user coordinates.
PointAnswer askStart(TzDbText::Justification& justification) {
    for (;;) {
        wchar_t const* const question = justification == TzDbText::kLeft
                                            ? localText(L"Start point")
                                            : localText(L"Alignment point");
        PointAnswer answer = askPointOrMore(question, kWords);
        if (!answer.isWord()) return answer;
        if (!justify(answer.word, justification)) return PointAnswer();
    }
}

// The height of a style that has one of its own, else 0.
double heightOfStyle() {
    Opened<TzDbTextStyleTableRecord> const style(ProgramSession::current().drawing().textstyle(),
                                                 TzDb::kForRead);
    return style ? style->textSize() : 0;
}

void followStyle(TzDbText& text) {
    Opened<TzDbTextStyleTableRecord> const style(text.textStyle(), TzDb::kForRead);
    if (!style) return;
    (void)text.setWidthFactor(style->xScale());  // a style holds what a text takes
    (void)text.setOblique(style->obliquingAngle());
}

bool askHeight(TzGePoint3d const& start, double& height) {
    height = heightOfStyle();
    if (height > 0) return true;
    Answer<double> const answer = askLength(localText(L"Text height"), &start,
                                            tzhost::Variables::instance().number(L"TEXTSIZE"));
    height = answer.value;
    return answer.asked == Asked::given;
}

// The next text proposes it, unless the style decides.
void keepHeight(double height) {
    if (heightOfStyle() > 0) return;
    // A length above 0 is within the limits.
    (void)tzhost::Variables::instance().set(L"TEXTSIZE", tzhost::VariableValue(height),
                                            tzhost::Writer::user);
}

}  // namespace

std::optional<TextPlace> askTextPlace(Justified justified) {
    TextPlace place;
    PointAnswer const start = justified == Justified::yes
                                  ? askStart(place.justification)
                                  : askPoint(localText(L"Start point"), nullptr);
    if (start.asked != Asked::given || !askHeight(start.point, place.height)) return std::nullopt;
    Answer<double> const angle = askAngle(localText(L"Rotation angle"), 0);
    if (angle.isCancelled()) return std::nullopt;
    UserPlane const plane = userPlane();
    place.point = toWorld(start.point);
    place.normal = plane.normal;
    place.rotation = plane.rotation(angle.value);
    return place;
}

void placeText(TzDbText& text, TextPlace const& place) {
    TzTextSetLayer::setTextLayer(&text);
    (void)text.setJustification(place.justification);
    (void)text.setAlignmentPoint(place.point);  // the host gives only values that a text takes
    (void)text.setNormal(place.normal);
    (void)text.setRotation(place.rotation);
    (void)text.setHeight(place.height);
    followStyle(text);
    keepHeight(place.height);
}

void textCommand() {
    std::optional<TextPlace> const place = askTextPlace(Justified::yes);
    if (!place) return;
    Answer<TzString> const contents = askText(localText(L"Text"));
    if (contents.asked != Asked::given) return;
    auto text = newEntity<TzDbText>();
    placeText(*text, *place);
    (void)text->setTextString(contents.value);
    post(std::move(text));
}

}  // namespace tzdraft
