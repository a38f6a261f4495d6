#include "host/editors/private_file.h"

#include <cstdlib>
#include <fstream>
#include <system_error>

#include "host/files/file_bytes.h"

namespace tzhost {

PrivateFile::PrivateFile(std::string_view name, std::string_view bytes) {
    std::error_code problem;
    std::filesystem::path const temporary = std::filesystem::temp_directory_path(problem);
    if (problem) return;
    std::string pattern = (temporary / "tzdraft-XXXXXX").string();
    if (!mkdtemp(pattern.data())) return;  // for the owner alone
    folder_ = pattern;
    file_ = folder_ / name;
    std::ofstream out(file_, std::ios::binary);
    out << bytes;
    made_ = static_cast<bool>(out.flush());
}

PrivateFile::~PrivateFile() {
    if (kept_ || folder_.empty()) return;
    std::error_code ignored;  // nothing can be done about a folder that will not go
    std::filesystem::remove_all(folder_, ignored);
}

std::optional<std::string> PrivateFile::read() const {
    return readFile(file_.string());
}

}  // namespace tzhost
