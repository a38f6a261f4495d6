#include "host/fonts/font_map_path.h"

#include <filesystem>
#include <utility>

#include "host/files/install_paths.h"
#include "tz/pal/ini_file.h"

namespace tzhost {

namespace {
constexpr char const* kShippedName = "TzmtedFonts.ini";
std::string chosenFile;
}  // namespace

std::string setFontMapFile(std::string path) {
    return std::exchange(chosenFile, std::move(path));
}

}  // namespace tzhost

TzString GetMTextMapFilename() {
    namespace fs = std::filesystem;
    if (!tzhost::chosenFile.empty()) {
        std::error_code none;
        return TzString::fromUtf8(fs::absolute(tzhost::chosenFile, none).string());
    }
    return TzString::fromUtf8((fs::path(tzhost::libraryFolder()) / tzhost::kShippedName).string());
}
