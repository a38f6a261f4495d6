#include "tests/module_ground/own_texts.h"

#include <filesystem>
#include <fstream>
#include <string>

#include "host/resources/resource_search.h"

int ownTexts(tzhost::ResourceTexts const& texts) {
    std::string const file = std::filesystem::absolute("own-texts.dll").string();
    std::ofstream(file, std::ios::binary) << tzhost::writeResourceFile(texts);
    tzhost::setResourceSearch({"", "", file});
    return static_cast<int>(texts.size());
}
