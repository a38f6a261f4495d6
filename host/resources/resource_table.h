#pragma once

// The readable form of a resource library: one table per language, which translators edit and the
// generator turns into the binary file. UTF-8, one text a line:
//
//   # a comment
//   [keywords]
//   1043<TAB>Justify _Justify
//
// An id is decimal or 0x and hexadecimal; escapes are those of host/text/text_escapes.h. The line
// in brackets says which rules hold for the texts below it:
//
//   [texts]            every percent sign opens a conversion or is doubled
//   [keywords]         as texts; "local text _global text", the global text alike in every language
//   [fixed]            as texts; alike in every language
//   [warnings]         no percent sign at all
//   [warning formats]  %d, and no other percent sign
//
// In all of them a translation has the conversions of the original, in the same order.

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "host/resources/resource_file.h"

namespace tzhost {

enum class ResourceRules { texts, keywords, fixed, warnings, warningFormats };

struct ResourceRow {
    std::uint32_t id;
    std::wstring text;
    ResourceRules rules;
    int line;
};

struct ResourceTable {
    std::string file;  // as faults name it
    std::vector<ResourceRow> rows;

    [[nodiscard]] ResourceTexts texts() const;
};

// What is wrong, one line each: "en.txt:12: the keyword has no \" _\"".
using ResourceFaults = std::vector<std::string>;

// Reads a table. A line with a fault is left out, and the fault is added to `faults`.
[[nodiscard]] ResourceTable
readResourceTable(std::string const& file, std::string_view bytes, ResourceFaults& faults);

// Adds the faults of a table: those of its own, and those against the table that it translates.
void checkResourceTable(ResourceTable const& table, ResourceFaults& faults);
void checkTranslation(ResourceTable const& original,
                      ResourceTable const& translation,
                      ResourceFaults& faults);

// A library as a table again, in one section; what readResourceTable reads.
[[nodiscard]] std::string writeResourceTable(ResourceTexts const& texts);

}  // namespace tzhost
