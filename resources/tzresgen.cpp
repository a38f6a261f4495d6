// Turns tables of texts into resource libraries:
//
//   tzresgen FOLDER ORIGINAL.txt [TRANSLATION.txt ...]
//       writes FOLDER/TzmtedRes.dll from the original and FOLDER/LL/TzmtedRes.dll from each LL.txt
//   tzresgen --list LIBRARY
//       prints a library as a table
//
// Nothing is written when a table has a fault; each is a line on standard error. Exit status 0, 1
// for faults, 2 for files that cannot be read or written and wrong usage.

#include <filesystem>
#include <iostream>
#include <optional>
#include <string>
#include <vector>

#include "host/files/file_bytes.h"
#include "host/resources/resource_file.h"
#include "host/resources/resource_table.h"

namespace {

namespace fs = std::filesystem;

constexpr char const* kLibraryName = "TzmtedRes.dll";
constexpr int kFaults = 1;
constexpr int kNoFile = 2;

int complain(std::string const& file) {
    std::cerr << file << ": " << tzhost::systemReason() << '\n';
    return kNoFile;
}

bool write(fs::path const& folder, tzhost::ResourceTable const& table) {
    std::error_code none;
    fs::create_directories(folder, none);
    std::string const bytes = tzhost::writeResourceFile(table.texts());
    return tzhost::writeFileSafely((folder / kLibraryName).string(), bytes);
}

int generate(fs::path const& folder, std::vector<std::string> const& files) {
    std::vector<tzhost::ResourceTable> tables;
    tzhost::ResourceFaults faults;
    for (std::string const& file : files) {
        auto const bytes = tzhost::readFile(file);
        if (!bytes) return complain(file);
        tables.push_back(tzhost::readResourceTable(file, *bytes, faults));
        tzhost::checkResourceTable(tables.back(), faults);
        if (tables.size() > 1) tzhost::checkTranslation(tables.front(), tables.back(), faults);
    }
    for (std::string const& fault : faults)
        std::cerr << fault << '\n';
    if (!faults.empty()) return kFaults;
    for (tzhost::ResourceTable const& table : tables) {
        bool const isOriginal = &table == &tables.front();
        fs::path const target = isOriginal ? folder : folder / fs::path(table.file).stem();
        if (!write(target, table)) return complain((target / kLibraryName).string());
    }
    return 0;
}

int list(std::string const& file) {
    auto bytes = tzhost::readFile(file);
    if (!bytes) return complain(file);
    auto const library = tzhost::ResourceFile::fromBytes(std::move(*bytes));
    if (!library) {
        std::cerr << file << ": no whole resource library\n";
        return kNoFile;
    }
    std::cout << tzhost::writeResourceTable(library->all());
    return 0;
}

}  // namespace

int main(int count, char** values) {
    std::vector<std::string> const arguments(values + 1, values + count);
    if (arguments.size() == 2 && arguments[0] == "--list") return list(arguments[1]);
    if (arguments.size() < 2) {
        std::cerr << "usage: tzresgen FOLDER ORIGINAL.txt [TRANSLATION.txt ...] | --list LIBRARY\n";
        return kNoFile;
    }
    return generate(arguments[0], {arguments.begin() + 1, arguments.end()});
}
