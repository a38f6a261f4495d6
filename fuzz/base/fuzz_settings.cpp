// Reads any bytes as a settings file. Holds when a file that is refused gives no settings, the
// complaint begins with a line of the file, and a file that is taken is no text beyond what it
// holds.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "host/settings/settings.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::string const bytes(data, data + size);
    tzhost::SettingsResult const read = tzhost::readSettings(bytes);
    if (read.error.empty()) {
        if (read.settings.productKey.size() + read.settings.denied.size() > size) std::abort();
        return 0;
    }
    auto const lines = 1 + std::count(bytes.begin(), bytes.end(), '\n');
    if (std::atol(read.error.c_str()) < 0 || std::atol(read.error.c_str()) > lines) std::abort();
    return 0;
}
