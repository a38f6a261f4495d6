#include "host/editors/private_file.h"

#include <cstdlib>
#include <fstream>
#include <new>
#include <system_error>

#include "host/base/memory_faults.h"
#include "host/files/file_bytes.h"

namespace tzhost {
namespace {

namespace fs = std::filesystem;

// The pattern of the folder's name; empty when there is no temporary directory.
std::string folderPattern() {
    std::error_code problem;
    fs::path const temporary = fs::temp_directory_path(problem);
    return problem ? std::string() : (temporary / "tzdraft-XXXXXX").string();
}

}  // namespace

// Nothing may throw once the folder is there.
PrivateFolder::PrivateFolder() : path_(folderPattern()) {
    made_ = !path_.empty() && mkdtemp(path_.data());
}

PrivateFolder::~PrivateFolder() {
    if (kept_ || !made_) return;
    MemoryFaultPause const givesBack;
    try {
        std::error_code ignored;
        fs::remove_all(path_, ignored);
    } catch (std::bad_alloc const&) {
        // Nothing can be done about a folder that will not go.
    }
}

PrivateFile::PrivateFile(std::string_view name, std::string_view bytes) {
    if (!folder_.made()) return;
    file_ = fs::path(folder_.path()) / name;
    std::ofstream out(file_, std::ios::binary);
    out << bytes;
    made_ = static_cast<bool>(out.flush());
}

bool PrivateFile::isThere() const {
    std::error_code problem;
    return fs::is_regular_file(file_, problem);
}

std::optional<std::string> PrivateFile::read() const {
    return readFile(file_.string());
}

}  // namespace tzhost
