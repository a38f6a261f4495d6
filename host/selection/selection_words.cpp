#include "host/selection/selection_words.h"

#include <algorithm>
#include <set>
#include <string>

#include "host/command_line/point_input.h"
#include "host/runtime/words.h"
#include "host/selection/corners.h"
#include "host/selection/entities_where.h"
#include "host/selection/fence.h"
#include "host/selection/pick.h"
#include "host/text/local_text.h"

namespace tzhost {

namespace {

using Answered = std::optional<SelectionAnswer>;

Answered answerWith(EntityIds ids) {
    return SelectionAnswer{SelectionAnswer::Kind::entities, std::move(ids)};
}

Answered cancelled() {
    return SelectionAnswer{SelectionAnswer::Kind::cancelled, EntityIds()};
}

// The box between the points of the line, or those that are asked for when the word stands alone.
Answered readBox(Words const& words, Touch touch) {
    if (words.size() == 1) {
        auto const asked = askBox();
        if (!asked) return cancelled();
        return answerWith(asked->box ? entitiesIn(*asked->box, touch) : EntityIds());
    }
    if (words.size() != 3) return std::nullopt;
    auto const first = readPoint(words[1], lastPoint());
    auto const second = first ? readPoint(words[2], *first) : std::nullopt;
    if (!second) return std::nullopt;
    setLastPoint(*second);  // a refused answer leaves the last point
    FlatBox const box = FlatBox::between(first->convert2d(), second->convert2d());
    return answerWith(entitiesIn(box, touch));
}

Answered readWindow(Words const& words) {
    return readBox(words, Touch::within);
}

Answered readCrossing(Words const& words) {
    return readBox(words, Touch::crossing);
}

// The points of the line, or those that are asked for when the word stands alone.
Answered readFence(Words const& words) {
    if (words.size() == 1) {
        auto const fence = askFence();
        if (!fence) return cancelled();
        return answerWith(entitiesAcross(*fence));
    }
    FencePoints fence;
    for (std::size_t i = 1; i < words.size(); ++i) {
        auto const point = readPoint(words[i], fence.empty() ? lastPoint() : fence.back());
        if (!point) return std::nullopt;
        fence.push_back(*point);
    }
    if (fence.size() < 2) return std::nullopt;
    setLastPoint(fence.back());  // a refused answer leaves the last point
    return answerWith(entitiesAcross(fence));
}

Answered readAll(Words const&) {
    return answerWith(entitiesOfActiveSpace());
}

Answered readLast(Words const&) {
    return answerWith(newestEntity());
}

Answered readPrevious(Words const&) {
    return answerWith(previousSelection());
}

Answered readAdd(Words const&) {
    return SelectionAnswer{SelectionAnswer::Kind::add, EntityIds()};
}

Answered readRemove(Words const&) {
    return SelectionAnswer{SelectionAnswer::Kind::remove, EntityIds()};
}

struct WordRow {
    wchar_t const* words;  // the whole one, a blank, and the short one
    Answered (*read)(Words const& words);
    std::size_t most;  // words on the line
};

constexpr std::size_t kAnyCount = std::wstring_view::npos;

constexpr WordRow kWords[] = {
    {forLocalText(L"window w"), readWindow, 3},
    {forLocalText(L"crossing c"), readCrossing, 3},
    {forLocalText(L"fence f"), readFence, kAnyCount},
    {forLocalText(L"all all"), readAll, 1},
    {forLocalText(L"last l"), readLast, 1},
    {forLocalText(L"previous p"), readPrevious, 1},
    {forLocalText(L"add a"), readAdd, 1},
    {forLocalText(L"remove r"), readRemove, 1},
};

// The row of a word, whatever follows it.
WordRow const* rowOf(std::wstring_view word, wchar_t const* (*shown)(wchar_t const*)) {
    for (WordRow const& row : kWords) {
        Words const names = splitWords(shown(row.words));
        bool const isWord = std::any_of(names.begin(), names.end(), [&](std::wstring_view name) {
            return isSameWord(word, name);
        });
        if (isWord) return &row;
    }
    return nullptr;
}

wchar_t const* asGlobal(wchar_t const* words) {
    return words;
}

// The row that a line means: a local word wins over a global one, and "_word" is only global.
WordRow const* rowMeant(Words const& words) {
    std::wstring_view word = words.front();
    bool const isGlobal = word.starts_with(L'_');
    WordRow const* row = isGlobal ? nullptr : rowOf(word, localText);
    if (row == nullptr) row = rowOf(isGlobal ? word.substr(1) : word, asGlobal);
    return row != nullptr && words.size() <= row->most ? row : nullptr;
}

Answered readHandles(Words const& words) {
    EntityIds ids;
    std::set<TzDbObjectId> seen;
    for (std::wstring_view const word : words) {
        auto const picked = pickByHandles(word);
        if (!picked) return std::nullopt;
        if (seen.insert(picked->top).second) ids.append(picked->top);
    }
    return answerWith(std::move(ids));
}

}  // namespace

EntityIds entitiesIn(FlatBox const& box, Touch touch) {
    return entitiesWhere(box, [&](Outline const& outline) {
        return touch == Touch::within ? outline.isWithin(box) : outline.touches(box);
    });
}

std::wstring missingHandle(std::wstring_view text) {
    for (std::wstring_view const word : splitWords(text)) {
        if (isHandles(word) && !pickByHandles(word)) return std::wstring(word);
    }
    return {};
}

std::wstring selectionWords() {
    std::wstring text;
    for (WordRow const& row : kWords) {
        if (!text.empty()) text += L", ";
        text += splitWords(localText(row.words)).front();
    }
    return text;
}

std::optional<SelectionAnswer> readSelection(std::wstring_view text) {
    Words const words = splitWords(text);
    if (words.empty()) return std::nullopt;
    if (isHandles(words.front())) return readHandles(words);
    if (WordRow const* const row = rowMeant(words)) return row->read(words);
    auto const point = takePoint(text);
    if (!point) return std::nullopt;
    EntityIds ids;
    if (auto const picked = pickAt(*point, Depth::top)) ids.append(picked->top);
    return answerWith(std::move(ids));
}

}  // namespace tzhost
