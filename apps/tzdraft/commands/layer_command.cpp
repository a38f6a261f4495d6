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

TzDbObjectId layerNamed(TzString const& name) {
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

TzString currentLayerName() {
    Opened<TzDbLayerTableRecord> const layer(ProgramSession::current().drawing().clayer(),
                                             TzDb::kForRead);
    return layer ? TzString(layer->getName()) : TzString();
}

void makeCurrent(TzDbObjectId layer) {
    if (!layer.isNull())
        (void)ProgramSession::current().drawing().setClayer(layer);  // a layer's id is taken
}

bool make() {
    Answer<TzString> const name =
        askName(localText(L"Name of the new layer, which becomes current"), offerLayers());
    if (name.asked != Asked::given) return !name.isCancelled();
    TzDbLayerTable* table = nullptr;
    if (ProgramSession::current().drawing().getLayerTable(table, TzDb::kForWrite) != Tzad::eOk)
        return true;
    Opened<TzDbLayerTable> const opened(table);
    TzDbObjectId const id = findOrAdd<TzDbLayerTableRecord>(table, name.value);
    if (id.isNull())
        tellProblem(localText(L"\"%ls\" cannot be the name of a layer."), name.value.kwszPtr());
    makeCurrent(id);
    return true;
}

bool set() {
    Answer<TzString> const name =
        askName(localText(L"Layer to make current"), offerLayers(), currentLayerName());
    if (name.asked == Asked::given) makeCurrent(layerNamed(name.value));
    return !name.isCancelled();
}

// Changes the layer that the user names.
template <class Change>
bool changeNamed(wchar_t const* question, Change change) {
    Answer<TzString> const name = askName(question, offerLayers(), currentLayerName());
    if (name.asked != Asked::given) return !name.isCancelled();
    TzDbObjectId const id = layerNamed(name.value);
    Opened<TzDbLayerTableRecord> const layer(id, TzDb::kForWrite);
    if (layer) change(*layer.get());
    return true;
}

bool color() {
    Answer<TzString> const text = askText(localText(L"Colour, 1 to 255 or #RRGGBB"), L"7");
    if (text.asked != Asked::given) return !text.isCancelled();
    std::optional<TzCmColor> const chosen = readColor(text.value.str());
    if (!chosen) {
        tellProblem(localText(L"\"%ls\" is no colour."), text.value.kwszPtr());
        return true;
    }
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

bool turnOff() {
    return changeNamed(localText(L"Layer to turn off"),
                       [](TzDbLayerTableRecord& layer) { (void)layer.setIsOff(true); });
}

// One that anything lies on stays, and so do "0" and the current one.
bool remove() {
    Answer<TzString> const name = askName(localText(L"Layer to delete"), offerLayers());
    if (name.asked != Asked::given) return !name.isCancelled();
    Opened<TzDbLayerTableRecord> const layer(layerNamed(name.value), TzDb::kForWrite);
    if (layer && layer->erase() != Tzad::eOk)
        tellProblem(localText(L"\"%ls\" is in use and stays."), layer->getName());
    return true;
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
