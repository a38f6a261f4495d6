// Replays seed inputs through a fuzzer without libFuzzer, so that they are tests in every build.
//
//   fuzz_markup FILE-OR-FOLDER...
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

namespace {

void replay(std::filesystem::path const& file) {
    std::ifstream in(file, std::ios::binary);
    std::vector<char> const bytes{std::istreambuf_iterator<char>(in), {}};
    std::vector<std::uint8_t> const input(bytes.begin(), bytes.end());
    // Named first: when an input crashes, the last line tells which.
    std::printf("%s: %zu bytes\n", file.c_str(), input.size());
    std::fflush(stdout);
    (void)LLVMFuzzerTestOneInput(input.data(), input.size());  // its result is always 0
}

}  // namespace

int main(int argc, char** argv) {
    (void)LLVMFuzzerTestOneInput(nullptr, 0);
    for (int i = 1; i < argc; ++i) {
        std::filesystem::path const path = argv[i];
        if (std::filesystem::is_regular_file(path)) replay(path);
        if (!std::filesystem::is_directory(path)) continue;
        for (auto const& entry : std::filesystem::recursive_directory_iterator(path)) {
            if (entry.is_regular_file()) replay(entry.path());
        }
    }
    return 0;
}
