#include "host/text/local_text.h"

#include <algorithm>
#include <optional>

#include "host/text/format_conversions.h"
#include "host/text/text_escapes.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

using Rows = std::vector<LocalTextRow>;

// Sorted by the English text.
Rows& localTexts() {
    static Rows rows;
    return rows;
}

bool isBefore(LocalTextRow const& a, LocalTextRow const& b) {
    return a.english < b.english;
}

// Reads a line into `row`. Returns what is wrong with the line, or nothing.
std::optional<std::string> readRow(std::string_view line, LocalTextRow& row) {
    if (firstBadByte(line) != kAllUtf8) return "the line is not UTF-8";
    std::size_t const tab = line.find('\t');
    if (tab == line.npos) return "expected a text, a tab and its translation";
    auto english = unescaped(fromUtf8(line.substr(0, tab)));
    auto local = unescaped(fromUtf8(line.substr(tab + 1)));
    if (!english || !local) return "a backslash opens no escape";
    if (english->empty() || local->empty()) return "a text is empty";
    if (conversionsOf(*english) != conversionsOf(*local)) return "the conversions differ";
    row.english = std::move(*english);
    row.local = std::move(*local);
    return std::nullopt;
}

// Sorts the rows and leaves out a row whose English text an earlier row has too.
void sortAndCheck(Rows& rows, std::vector<std::string>& faults) {
    std::stable_sort(rows.begin(), rows.end(), isBefore);
    auto const isSecond = [&](LocalTextRow const& first, LocalTextRow const& second) {
        if (first.english != second.english) return false;
        faults.push_back(std::to_string(second.line) + ": stands in line " +
                         std::to_string(first.line) + " too");
        return true;
    };
    rows.erase(std::unique(rows.begin(), rows.end(), isSecond), rows.end());
}

}  // namespace

Rows readLocalTexts(std::string_view bytes, std::vector<std::string>& faults) {
    Rows rows;
    for (int number = 1; !bytes.empty(); ++number) {
        std::size_t const end = std::min(bytes.find('\n'), bytes.size());
        std::string_view const line = bytes.substr(0, end);
        bytes.remove_prefix(std::min(end + 1, bytes.size()));
        if (line.empty() || line[0] == '#') continue;
        LocalTextRow row{{}, {}, number};
        if (auto const fault = readRow(line, row)) {
            faults.push_back(std::to_string(number) + ": " + *fault);
        } else {
            rows.push_back(std::move(row));
        }
    }
    sortAndCheck(rows, faults);
    return rows;
}

void setLocalTexts(Rows rows) {
    localTexts() = std::move(rows);
}

wchar_t const* localText(wchar_t const* english) {
    Rows const& rows = localTexts();
    std::wstring_view const wanted(english);
    auto const at = std::lower_bound(
        rows.begin(), rows.end(), wanted,
        [](LocalTextRow const& row, std::wstring_view text) { return row.english < text; });
    return at != rows.end() && at->english == wanted ? at->local.c_str() : english;
}

std::string localText(char const* english) {
    if (localTexts().empty()) return english;
    return toUtf8(localText(fromUtf8(english).c_str()));
}

}  // namespace tzhost
