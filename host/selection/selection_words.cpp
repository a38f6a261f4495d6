#include "host/selection/selection_words.h"

#include <string>
#include <vector>

#include "host/command_line/point_input.h"
#include "host/selection/pick.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {

using Words = std::vector<std::wstring_view>;
using Answered = std::optional<SelectionAnswer>;

Words splitWords(std::wstring_view text) {
    constexpr std::wstring_view kBlanks = L" \t";
    Words words;
    for (std::size_t start = text.find_first_not_of(kBlanks); start != text.npos;
         start = text.find_first_not_of(kBlanks)) {
        text.remove_prefix(start);
        words.push_back(text.substr(0, text.find_first_of(kBlanks)));
        text.remove_prefix(words.back().size());
    }
    return words;
}

std::optional<TzGePoint3d> takePoint(std::wstring_view text) {
    auto const point = readPoint(text, lastPoint());
    if (point) setLastPoint(*point);
    return point;
}

Answered answerWith(EntityIds ids) {
    return SelectionAnswer{SelectionAnswer::Kind::entities, std::move(ids)};
}

Answered readBox(Words const& words, Touch touch) {
    if (words.size() != 3) return std::nullopt;
    auto const first = takePoint(words[1]);
    auto const second = first ? takePoint(words[2]) : std::nullopt;
    if (!second) return std::nullopt;
    FlatBox const box = FlatBox::between(first->convert2d(), second->convert2d());
    return answerWith(entitiesIn(box, touch));
}

Answered readWindow(Words const& words) {
    return readBox(words, Touch::within);
}

Answered readCrossing(Words const& words) {
    return readBox(words, Touch::crossing);
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
    wchar_t const* word;
    wchar_t const* letter;
    Answered (*read)(Words const& words);
    std::size_t count;  // of words on the line
};

constexpr WordRow kWords[] = {
    {L"window",   L"w",   readWindow,   3},
    {L"crossing", L"c",   readCrossing, 3},
    {L"all",      L"all", readAll,      1},
    {L"last",     L"l",   readLast,     1},
    {L"previous", L"p",   readPrevious, 1},
    {L"add",      L"a",   readAdd,      1},
    {L"remove",   L"r",   readRemove,   1},
};

Answered readHandles(Words const& words) {
    EntityIds ids;
    for (std::wstring_view const word : words) {
        auto const picked = pickByHandles(word);
        if (!picked) return std::nullopt;
        ids.append(picked->top);
    }
    return answerWith(std::move(ids));
}

}  // namespace

EntityIds entitiesIn(FlatBox const& box, Touch touch) {
    EntityIds found;
    for (TzDbObjectId const id : entitiesOfActiveSpace()) {
        Outline const outline = Outline::of(*entityOf(id));
        if (touch == Touch::within ? outline.isWithin(box) : outline.touches(box)) {
            found.append(id);
        }
    }
    return found;
}

std::optional<SelectionAnswer> readSelection(std::wstring_view text) {
    Words const words = splitWords(text);
    if (words.empty()) return std::nullopt;
    if (isHandles(words.front())) return readHandles(words);
    std::wstring first(words.front());
    if (first.starts_with(L'_')) first.erase(0, 1);
    for (WordRow const& row : kWords) {
        bool const isWord = tzCompareNoCase(first.c_str(), row.word) == 0 ||
                            tzCompareNoCase(first.c_str(), row.letter) == 0;
        if (isWord && words.size() == row.count) return row.read(words);
    }
    auto const point = takePoint(text);
    if (!point) return std::nullopt;
    EntityIds ids;
    if (auto const picked = pickAt(*point, Depth::top)) ids.append(picked->top);
    return answerWith(std::move(ids));
}

}  // namespace tzhost
