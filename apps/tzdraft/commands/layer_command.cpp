#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/color_text.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

TzString currentLayerName() {
    Opened<TzDbLayerTableRecord> const layer(ProgramSession::current().drawing().clayer(),
                                             TzDb::kForRead);
    return layer ? TzString(layer->getName()) : TzString();
}

bool list() {
    TzDbLayerTable* table = nullptr;
    TzDbSymbolTableIterator* found = nullptr;
    if (ProgramSession::current().drawing().getLayerTable(table, TzDb::kForRead) != Tzad::eOk)
        return true;
    Opened<TzDbLayerTable> const opened(table);
    if (table->newIterator(found) != Tzad::eOk) return true;
    std::unique_ptr<TzDbSymbolTableIterator> const walk(found);
    for (walk->start(); !walk->done(); walk->step()) {
        Opened<TzDbLayerTableRecord> const layer(walk->getRecordId(), TzDb::kForRead);
        if (!layer) continue;
        tzutPrintf(localText(L"\n\"%ls\", colour %ls%ls%ls"), layer->getName(),
                   writeColor(layer->color()).c_str(), layer->isOff() ? localText(L", off") : L"",
                   layer->isLocked() ? localText(L", locked") : L"");
    }
    tzutPrintf(localText(L"\nCurrent layer: \"%ls\".\n"), currentLayerName().kwszPtr());
    return true;
}

// "?" lists them, as at the other questions for names.
TzDbObjectId layerNamed(TzString const& name) {
    if (name == L"?") {
        (void)list();  // which is done, and no cancel
        return {};
    }
    TzDbLayerTable* table = nullptr;
    TzDbObjectId id;
    if (ProgramSession::current().drawing().getLayerTable(table, TzDb::kForRead) != Tzad::eOk)
        return id;
    Opened<TzDbLayerTable> const opened(table);
    if (table->getIdAt(name, id) != Tzad::eOk) {
        tellProblem(localText(L"There is no layer \"%ls\"."), name.kwszPtr());
    }
    return id;
}

void makeCurrent(TzDbObjectId layer) {
    if (!layer.isNull())
        (void)ProgramSession::current().drawing().setClayer(layer);  // a layer's id is taken
}

// The layer of that name, which is made where there is none.
TzDbObjectId layerToBe(TzString const& name) {
    TzDbLayerTable* table = nullptr;
    if (ProgramSession::current().drawing().getLayerTable(table, TzDb::kForWrite) != Tzad::eOk)
        return {};
    Opened<TzDbLayerTable> const opened(table);
    TzDbObjectId const id = findOrAdd<TzDbLayerTableRecord>(table, name);
    if (id.isNull()) tellNoName(localText(L"\"%ls\" cannot be the name of a layer."), name);
    return id;
}

// Asks for a name until `find` gives its layer.
Answer<TzDbObjectId> askLayer(wchar_t const* question,
                              TzString const& proposed,
                              TzDbObjectId (*find)(TzString const&) = layerNamed) {
    Answer<TzDbObjectId> layer;
    layer.asked = askUntil([&] { return askName(question, offerLayers(), proposed); },
                           [&](Answer<TzString> const& name) {
                               layer.value = find(name.value);
                               return !layer.value.isNull();
                           })
                      .asked;
    return layer;
}

bool make() {
    auto const layer =
        askLayer(localText(L"Name of the new layer, which becomes current"), L"", layerToBe);
    if (layer.asked == Asked::given) makeCurrent(layer.value);
    return !layer.isCancelled();
}

bool set() {
    auto const layer = askLayer(localText(L"Layer to make current"), currentLayerName());
    if (layer.asked == Asked::given) makeCurrent(layer.value);
    return !layer.isCancelled();
}

// Changes the layer that the user names.
template <class Change>
bool changeNamed(wchar_t const* question, Change change) {
    auto const named = askLayer(question, currentLayerName());
    if (named.asked != Asked::given) return !named.isCancelled();
    Opened<TzDbLayerTableRecord> const layer(named.value, TzDb::kForWrite);
    if (layer) change(*layer.get());
    return true;
}

bool color() {
    std::optional<TzCmColor> chosen;
    Answer<TzString> const text =
        askUntil([] { return askText(localText(L"Colour, 1 to 255 or #RRGGBB"), L"7"); },
                 [&](Answer<TzString> const& answer) {
                     chosen = readColor(answer.value.str());
                     if (!chosen)
                         tellProblem(localText(L"\"%ls\" is no colour."), answer.value.kwszPtr());
                     return chosen.has_value();
                 });
    if (text.asked != Asked::given) return !text.isCancelled();
    return changeNamed(localText(L"Layer to colour"),
                       [&](TzDbLayerTableRecord& layer) { (void)layer.setColor(*chosen); });
}

bool lock() {
    return changeNamed(localText(L"Layer to lock"),
                       [](TzDbLayerTableRecord& layer) { (void)layer.setIsLocked(true); });
}

bool unlock() {
    return changeNamed(localText(L"Layer to unlock"),
                       [](TzDbLayerTableRecord& layer) { (void)layer.setIsLocked(false); });
}

bool turnOn() {
    return changeNamed(localText(L"Layer to turn on"),
                       [](TzDbLayerTableRecord& layer) { (void)layer.setIsOff(false); });
}

// A person who goes on drawing there is told.
void hide(TzDbLayerTableRecord& layer) {
    (void)layer.setIsOff(true);
    bool const isCurrent = layer.objectId() == ProgramSession::current().drawing().clayer();
    if (isCurrent && tzhost::commandLine().isPerson())
        tzutPrintf(localText(L"\n\"%ls\" is current: what is drawn now does not show.\n"),
                   layer.getName());
}

bool turnOff() {
    return changeNamed(localText(L"Layer to turn off"), hide);
}

// One that anything lies on stays, and so do "0" and the current one.
TzDbObjectId removed(TzString const& name) {
    TzDbObjectId const id = layerNamed(name);
    Opened<TzDbLayerTableRecord> const layer(id, TzDb::kForWrite);
    if (!layer || layer->erase() == Tzad::eOk) return id;
    tellProblem(localText(L"\"%ls\" is in use and stays."), layer->getName());
    return {};
}

bool remove() {
    return !askLayer(localText(L"Layer to delete"), L"", removed).isCancelled();
}

// One choice of the command; its action returns false when it was cancelled.
struct Choice {
    wchar_t const* word;
    bool (*action)();
};

constexpr wchar_t const* kWords = forLocalText(L"Make Set ON OFf Color LOck Unlock Delete ?");
constexpr Choice kChoices[] = {
    {L"Make", make}, {L"Set", set},       {L"ON", turnOn},     {L"OFf", turnOff}, {L"Color", color},
    {L"LOck", lock}, {L"Unlock", unlock}, {L"Delete", remove}, {L"?", list},
};

bool act(TzString const& word) {
    for (Choice const& each : kChoices) {
        if (word == each.word) return each.action();
    }
    return true;
}

}  // namespace

void layerCommand() {
    for (;;) {
        Answer<TzString> const word = askKeyword(L"", kWords);
        if (word.asked != Asked::given || !act(word.value)) return;
    }
}

}  // namespace tzdraft
