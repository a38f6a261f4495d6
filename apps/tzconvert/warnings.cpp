#include "apps/tzconvert/warnings.h"

#include <algorithm>

#include "apps/tzconvert/program_texts.h"

namespace tzconvert {
namespace {

struct IncidentRow {
    ConversionIncident incident;
    char const* text;
};
// A font file that a proxy stands for comes back as itself, and a late code holds: neither warns.
constexpr IncidentRow kIncidents[] = {
    {kUnknownCode, forLocalText("unknown codes, kept as text")},
    {kStackWithoutSign, forLocalText("stacks without a sign, kept as text")},
    {kFaceWithoutFile, forLocalText("faces that no file is known of")},
    {kTrackingIgnored, forLocalText("further \\T codes, lost")},
    {kCharWidthIgnored, forLocalText("further \\W codes, lost")},
    {kObliqueIgnored, forLocalText("further \\Q codes, lost")},
};

void add(Warnings& warnings, std::string const& text, int count) {
    if (count > 0) warnings.push_back(text + ": " + std::to_string(count));
}

// Control words are ASCII letters.
void add(Warnings& warnings, std::string const& text, RtfLosses::Kind const& kind) {
    if (kind.count == 0) return;
    add(warnings, text, kind.count);
    std::string const word(kind.first.begin(), kind.first.end());
    warnings.back() += filled(localText(", the first %s"), {"\\" + word});
}

template <class Char>
bool beginsAsRtf(std::basic_string_view<Char> input) {
    constexpr Char kHead[] = {'{', '\\', 'r', 't', 'f', 0};
    std::size_t begin = 0;
    while (begin < input.size() && (input[begin] == ' ' || input[begin] == '\n'))
        ++begin;
    return input.substr(begin).starts_with(kHead);
}

// Whether a code with a capital stands near the beginning: the words of RTF have small letters.
template <class Char>
bool holdsMarkup(std::basic_string_view<Char> input) {
    constexpr std::size_t kEnough = 4096;
    std::size_t const end = std::min(input.size(), kEnough);
    for (std::size_t at = 0; at + 1 < end; ++at) {
        if (input[at] == '\\' && input[++at] >= 'A' && input[at] <= 'Z') return true;
    }
    return false;
}

template <class Char>
void look(Warnings& warnings, Direction direction, std::basic_string_view<Char> input) {
    if (!readsRtf(direction)) {
        if (beginsAsRtf(input))
            warnings.push_back(localText("it looks like RTF; to-mtext converts that"));
    } else if (!beginsAsRtf(input) && holdsMarkup(input)) {
        warnings.push_back(localText("it looks like markup; to-rtf converts that"));
    }
}

}  // namespace

void addIncidents(Warnings& warnings, MarkupFindings const& found) {
    for (IncidentRow const& row : kIncidents)
        add(warnings, localText(row.text), found.incidentCounts.of(row.incident));
}

void addLosses(Warnings& warnings, RtfLosses const& losses) {
    add(warnings, localText("unknown words, passed over"), losses.unknownWords);
    add(warnings,
        localText("texts lost with the unknown word before them, which --normalise keeps"),
        losses.texts);
    if (losses.hasTextAfterEnd)
        warnings.push_back(localText("what stands behind the last \"}\" is lost"));
}

void addLook(Warnings& warnings, Direction direction, std::wstring_view input) {
    look(warnings, direction, input);
}

void addLook(Warnings& warnings, Direction direction, std::string_view input) {
    look(warnings, direction, input);
}

}  // namespace tzconvert
