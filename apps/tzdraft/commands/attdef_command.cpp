#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/commands/text_command.h"
#include "apps/tzdraft/program_texts.h"
#include "host/database/geometry.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

constexpr wchar_t const* kKinds = forLocalText(L"Single Multiple");

bool isTag(Answer<TzString> const& tag) {
    bool const hasBlanks = tag.value.findOneOf(L" \t") >= 0;
    if (hasBlanks) tellProblem(localText(L"A tag has no blanks."));
    return !hasBlanks;
}

// The lines that a multi-line definition holds. `contents` is markup.
std::unique_ptr<TzDbMText> linesOf(TextPlace const& place, TzString const& contents) {
    auto lines = newEntity<TzDbMText>();
    (void)lines->setLocation(place.point);  // as of the definition, which has taken them
    (void)lines->setNormal(place.normal);
    (void)lines->setDirection(tzhost::directionAt(place.normal, place.rotation));
    (void)lines->setTextHeight(place.height);
    (void)lines->setContents(contents);
    return lines;
}

}  // namespace

void attdefCommand() {
    Answer<TzString> const kind =
        askKeyword(localText(L"Lines of the attribute"), kKinds, L"Single");
    if (kind.isCancelled()) return;
    Answer<TzString> const tag =
        askUntil([] { return askText(localText(L"Attribute tag")); }, isTag);
    if (tag.asked != Asked::given) return;
    Answer<TzString> const prompt = askText(localText(L"Prompt for its value"), tag.value);
    if (prompt.isCancelled()) return;
    Answer<TzString> const value = askText(localText(L"Default value"));
    if (value.isCancelled()) return;
    bool const isOneLine = kind.value != L"Multiple";
    std::optional<TextPlace> const place = askTextPlace(isOneLine ? Justified::yes : Justified::no);
    if (!place) return;
    auto definition = newEntity<TzDbAttributeDefinition>();
    placeText(*definition, *place);
    (void)definition->setTag(tag.value);
    (void)definition->setPrompt(prompt.value);
    (void)definition->setTextString(value.value);
    if (!isOneLine) {
        auto lines = linesOf(*place, value.value);
        if (definition->setMTextAttributeDefinition(lines.get()) == Tzad::eOk)
            (void)lines.release();
    }
    post(std::move(definition));
}

}  // namespace tzdraft
