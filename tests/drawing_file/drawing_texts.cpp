#include "tests/drawing_file/drawing_texts.h"

#include <fstream>
#include <sstream>

namespace tzhost::test {

std::filesystem::path scratch(std::string_view name) {
    return std::filesystem::current_path() / name;
}

void writeBytes(std::filesystem::path const& file, std::string_view bytes) {
    std::ofstream(file, std::ios::binary) << bytes;
}

std::string bytesOf(std::filesystem::path const& file) {
    std::ostringstream bytes;
    bytes << std::ifstream(file, std::ios::binary).rdbuf();
    return bytes.str();
}

}  // namespace tzhost::test
