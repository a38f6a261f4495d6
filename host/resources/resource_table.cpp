#include "host/resources/resource_table.h"

#include <algorithm>
#include <charconv>
#include <iterator>
#include <optional>

#include "host/text/format_conversions.h"
#include "host/text/text_escapes.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

struct SectionRow {
    std::string_view name;
    ResourceRules rules;
};

constexpr SectionRow kSections[] = {
    {"[texts]", ResourceRules::texts},
    {"[keywords]", ResourceRules::keywords},
    {"[fixed]", ResourceRules::fixed},
    {"[warnings]", ResourceRules::warnings},
    {"[warning formats]", ResourceRules::warningFormats},
};

constexpr std::wstring_view kSeparator = L" _";
constexpr std::string_view kBadPercent = "a percent sign opens no conversion";

std::string at(std::string const& file, int line) {
    return file + ':' + std::to_string(line) + ": ";
}

std::optional<std::uint32_t> readId(std::string_view text) {
    bool const isHex = text.substr(0, 2) == "0x";
    if (isHex) text.remove_prefix(2);
    std::uint32_t id = 0;
    auto const [end, error] =
        std::from_chars(text.data(), text.data() + text.size(), id, isHex ? 16 : 10);
    if (error != std::errc{} || end != text.data() + text.size()) return std::nullopt;
    return id;
}

// Reads the lines of one table.
class Reader {
public:
    Reader(std::string const& file, ResourceFaults& faults) : faults_(faults) {
        table_.file = file;
    }

    void readLine(std::string_view line) {
        ++number_;
        if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
        if (line.empty() || line[0] == '#') return;
        if (line[0] == '[') {
            readSection(line);
        } else {
            readRow(line);
        }
    }

    [[nodiscard]] ResourceTable take() { return std::move(table_); }

private:
    void readSection(std::string_view line) {
        auto const row = std::find_if(std::begin(kSections), std::end(kSections),
                                      [line](SectionRow const& each) { return each.name == line; });
        if (row == std::end(kSections)) {
            fault("no such section: " + std::string(line));
        } else {
            rules_ = row->rules;
        }
    }

    void readRow(std::string_view line) {
        std::size_t const tab = line.find('\t');
        auto const id = readId(line.substr(0, tab));
        if (tab == line.npos || !id) return fault("expected an id, a tab and a text");
        std::string_view const rest = line.substr(tab + 1);
        if (firstBadByte(rest) != kAllUtf8) return fault("the text is not UTF-8");
        auto text = unescaped(fromUtf8(rest));
        if (!text) return fault("a backslash opens no escape");
        table_.rows.push_back({*id, std::move(*text), rules_, number_});
    }

    void fault(std::string const& what) { faults_.push_back(at(table_.file, number_) + what); }

    ResourceTable table_;
    ResourceFaults& faults_;
    ResourceRules rules_ = ResourceRules::texts;
    int number_ = 0;
};

std::wstring_view globalPartOf(std::wstring_view keyword) {
    std::size_t const separator = keyword.find(kSeparator);
    return separator == keyword.npos ? std::wstring_view()
                                     : keyword.substr(separator + kSeparator.size());
}

std::optional<std::string> faultOfKeyword(std::wstring_view text) {
    std::size_t const separator = text.find(kSeparator);
    if (separator == text.npos) return "the keyword has no \" _\"";
    if (separator == 0 || globalPartOf(text).empty())
        return "the keyword lacks a local or global text";
    if (globalPartOf(text).find(kSeparator) != text.npos) return "the keyword has two \" _\"";
    return std::nullopt;
}

std::optional<std::string> faultOf(ResourceRow const& row) {
    bool const hasPercent = row.text.find(L'%') != row.text.npos;
    if (row.rules == ResourceRules::warnings && hasPercent) {
        return "a warning text has a percent sign";
    }
    auto const conversions = conversionsOf(row.text);
    if (!conversions) return std::string(kBadPercent);
    if (row.rules == ResourceRules::warningFormats &&
        std::any_of(conversions->begin(), conversions->end(),
                    [](std::wstring const& each) { return each != L"d"; })) {
        return "a warning format has a percent sign that is no %d";
    }
    if (row.rules == ResourceRules::keywords) return faultOfKeyword(row.text);
    return std::nullopt;
}

ResourceRow const* rowWith(ResourceTable const& table, std::uint32_t id) {
    auto const row = std::find_if(table.rows.begin(), table.rows.end(),
                                  [id](ResourceRow const& each) { return each.id == id; });
    return row == table.rows.end() ? nullptr : &*row;
}

std::optional<std::string> faultOfTranslation(ResourceRow const& original,
                                              ResourceRow const& translated) {
    if (conversionsOf(original.text) != conversionsOf(translated.text)) {
        return "other conversions than the original has";
    }
    if (original.rules != translated.rules) return "another section than the original's";
    if (original.rules == ResourceRules::fixed && original.text != translated.text) {
        return "differs from the original, and may not";
    }
    if (original.rules == ResourceRules::keywords &&
        globalPartOf(original.text) != globalPartOf(translated.text)) {
        return "another global text than the original's";
    }
    return std::nullopt;
}

}  // namespace

ResourceTexts ResourceTable::texts() const {
    ResourceTexts all;
    for (ResourceRow const& row : rows)
        all.emplace(row.id, row.text);
    return all;
}

ResourceTable
readResourceTable(std::string const& file, std::string_view bytes, ResourceFaults& faults) {
    Reader reader(file, faults);
    while (!bytes.empty()) {
        std::size_t const end = bytes.find('\n');
        reader.readLine(bytes.substr(0, end));
        bytes.remove_prefix(end == bytes.npos ? bytes.size() : end + 1);
    }
    return reader.take();
}

void checkResourceTable(ResourceTable const& table, ResourceFaults& faults) {
    std::map<std::uint32_t, int> lines;
    for (ResourceRow const& row : table.rows) {
        auto const [first, isNew] = lines.emplace(row.id, row.line);
        if (!isNew) {
            faults.push_back(at(table.file, row.line) + "the id " + std::to_string(row.id) +
                             " stands in line " + std::to_string(first->second) + " too");
        }
        if (auto const fault = faultOf(row)) faults.push_back(at(table.file, row.line) + *fault);
    }
}

void checkTranslation(ResourceTable const& original,
                      ResourceTable const& translation,
                      ResourceFaults& faults) {
    for (ResourceRow const& row : original.rows) {
        ResourceRow const* const translated = rowWith(translation, row.id);
        if (translated == nullptr) {
            faults.push_back(translation.file + ": the id " + std::to_string(row.id) +
                             " is missing");
            continue;
        }
        auto const fault = faultOfTranslation(row, *translated);
        if (fault) faults.push_back(at(translation.file, translated->line) + *fault);
    }
    for (ResourceRow const& row : translation.rows) {
        if (rowWith(original, row.id) != nullptr) continue;
        faults.push_back(at(translation.file, row.line) + "the original has no id " +
                         std::to_string(row.id));
    }
}

std::string writeResourceTable(ResourceTexts const& texts) {
    std::string table;
    for (auto const& [id, text] : texts) {
        table += std::to_string(id) + '\t' + toUtf8(escaped(text)) + '\n';
    }
    return table;
}

}  // namespace tzhost
