#include "host/base/resource_search.h"

#include <filesystem>
#include <utility>
#include <vector>

#include "host/base/file_bytes.h"
#include "host/base/install_paths.h"
#include "host/base/utf8.h"

namespace tzhost {

namespace {

namespace fs = std::filesystem;

ResourceSearch currentSearch;

std::vector<fs::path> candidates(fs::path const& name) {
    if (!currentSearch.file.empty()) return {currentSearch.file};
    if (name.has_parent_path()) return {name};
    fs::path const folder = currentSearch.folder.empty() ? libraryFolder() : currentSearch.folder;
    std::string const locale = currentSearch.locale.substr(0, currentSearch.locale.find('.'));
    std::string const language = locale.substr(0, locale.find_first_of("_-"));
    std::vector<fs::path> paths;
    for (std::string const& part : {locale, language}) {
        // A locale is a plain word: one that would lead elsewhere is none.
        if (part.empty() || part.find_first_of("/.") != part.npos) continue;
        paths.push_back(folder / part / name);
    }
    paths.push_back(folder / name);
    return paths;
}

}  // namespace

ResourceSearch setResourceSearch(ResourceSearch search) {
    return std::exchange(currentSearch, std::move(search));
}

std::optional<ResourceFile> openResourceFile(std::wstring const& name) {
    for (fs::path const& path : candidates(toUtf8(name))) {
        auto bytes = readFile(path.string());
        if (bytes) return ResourceFile::fromBytes(std::move(*bytes));
    }
    return std::nullopt;
}

}  // namespace tzhost
