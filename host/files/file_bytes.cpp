#include "host/files/file_bytes.h"

#include <cerrno>

#include "host/files/file_kind.h"
#include "host/files/file_reader.h"
#include "host/files/safe_file.h"
#include "host/text/local_text.h"
#include "host/text/system_words.h"

namespace tzhost {

std::optional<std::string> readFile(std::string const& path) {
    constexpr std::size_t kPiece = 1 << 16;
    if (!isFile(path)) return std::nullopt;
    FileReader reader(path);
    std::string bytes;
    for (std::size_t room = reader.expectedSize() + 1;; room = kPiece) {
        std::size_t const before = bytes.size();
        bytes.resize(before + room);
        bytes.resize(before + reader.read(bytes.data() + before, room));
        if (reader.hasFailed()) return std::nullopt;
        if (bytes.size() < before + room) return bytes;
    }
}

bool writeFileSafely(std::string const& path, std::string_view bytes) {
    SafeFile file(path);
    bool const written = file.isOpen() && file.write(bytes) && file.commit();
    int const problem = file.problem();
    if (!written) errno = problem;
    return written;
}

std::string systemReason() {
    return errno == kNoFile ? localText("it is a device or a pipe") : systemWords(errno);
}

}  // namespace tzhost
