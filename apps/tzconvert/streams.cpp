#include "apps/tzconvert/streams.h"

#include <array>
#include <cstdio>

#include "apps/tzconvert/text_codec.h"
#include "host/base/file_bytes.h"

namespace tzconvert {
namespace {

constexpr std::size_t kPiece = 1 << 16;

std::optional<std::string> readStandardInput() {
    std::string bytes;
    std::size_t read = 0;
    do {
        std::size_t const start = bytes.size();
        bytes.resize(start + kPiece);
        read = std::fread(bytes.data() + start, 1, kPiece, stdin);
        bytes.resize(start + read);
    } while (read == kPiece);
    if (std::ferror(stdin)) return {};
    return bytes;
}

std::string shownName(std::string const& file) {
    return file == "-" ? "standard input" : file;
}

Failure writeStandardOutput(std::string_view bytes) {
    if (std::fwrite(bytes.data(), 1, bytes.size(), stdout) == bytes.size() &&
        std::fflush(stdout) == 0) {
        return {};
    }
    return "standard output: " + tzhost::systemReason();
}

}  // namespace

Failure readText(std::string const& file, std::wstring& text) {
    std::optional<std::string> const bytes =
        file == "-" ? readStandardInput() : tzhost::readFile(file);
    if (!bytes) return shownName(file) + ": cannot be read: " + tzhost::systemReason();
    if (std::optional<BadByte> const bad = decodeText(*bytes, text))
        return shownName(file) + ": byte " + std::to_string(bad->offset) + ": " + bad->reason;
    return {};
}

Failure writeText(std::string const& file, std::wstring_view text) {
    std::string bytes;
    if (!file.empty()) {
        bytes.reserve(text.size());
        encodeText(text, bytes);
        return writeBytes(file, bytes);
    }
    bytes.reserve(kPiece * 4);
    while (!text.empty()) {
        bytes.clear();
        encodeText(text.substr(0, kPiece), bytes);
        text.remove_prefix(text.size() < kPiece ? text.size() : kPiece);
        if (Failure const failure = writeStandardOutput(bytes)) return failure;
    }
    return {};
}

Failure writeBytes(std::string const& file, std::string_view bytes) {
    if (file.empty()) return writeStandardOutput(bytes);
    if (tzhost::writeFileSafely(file, bytes)) return {};
    return file + ": cannot be written: " + tzhost::systemReason();
}

}  // namespace tzconvert
