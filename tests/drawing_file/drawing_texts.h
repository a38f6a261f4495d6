#pragma once

#include <filesystem>
#include <string>
#include <string_view>

// Files for the tests of drawings.
namespace tzhost::test {

// A path in the scratch folder of the suite.
[[nodiscard]] std::filesystem::path scratch(std::string_view name);
void writeBytes(std::filesystem::path const& file, std::string_view bytes);
[[nodiscard]] std::string bytesOf(std::filesystem::path const& file);

}  // namespace tzhost::test
