// The least that a converter of a whole file can do, as the measure of tzconvert: bytes to wide
// characters, a copy, back to bytes on standard output.
#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <string>

int main(int count, char** arguments) {
    if (count != 2) return 2;
    std::FILE* const file = std::fopen(arguments[1], "rb");
    if (!file) return 2;
    std::string bytes(std::filesystem::file_size(arguments[1]), '\0');
    std::size_t const read = std::fread(bytes.data(), 1, bytes.size(), file);
    std::fclose(file);
    if (read != bytes.size()) return 2;
    std::wstring const wide(bytes.begin(), bytes.end());
    std::wstring const copy = wide;
    std::string out(copy.size(), '\0');
    std::transform(copy.begin(), copy.end(), out.begin(),
                   [](wchar_t c) { return static_cast<char>(c); });
    return std::fwrite(out.data(), 1, out.size(), stdout) == out.size() ? 0 : 2;
}
