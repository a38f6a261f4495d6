#include "host/resources/resource_search.h"

#include <filesystem>
#include <utility>

#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"
#include "host/resources/language.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

namespace fs = std::filesystem;

ResourceSearch currentSearch;

fs::path placeOf(std::string const& name) {
    if (!currentSearch.file.empty()) return currentSearch.file;
    if (fs::path(name).has_parent_path()) return name;
    fs::path const folder = currentSearch.folder.empty() ? libraryFolder() : currentSearch.folder;
    return translatedFile(folder, currentSearch.locale, name).value_or(folder / name);
}

}  // namespace

ResourceSearch setResourceSearch(ResourceSearch search) {
    return std::exchange(currentSearch, std::move(search));
}

ResourceSearch const& resourceSearch() {
    return currentSearch;
}

std::optional<ResourceFile> openResourceFile(std::wstring const& name) {
    auto bytes = readFile(placeOf(toUtf8(name)).string());
    return bytes ? ResourceFile::fromBytes(std::move(*bytes)) : std::nullopt;
}

}  // namespace tzhost
