#include "apps/tzconvert/streams.h"

#include <algorithm>
#include <cstdio>
#include <memory>

#include "apps/tzconvert/program_texts.h"
#include "apps/tzconvert/text_codec.h"
#include "host/files/file_bytes.h"
#include "host/files/file_reader.h"
#include "host/files/standard_streams.h"
#include "host/text/visible_text.h"

namespace tzconvert {
namespace {

constexpr std::size_t kPiece = 1 << 16;

// Memory for a piece, as it comes: a batch of small files would notice its filling.
auto makePiece() {
    return std::make_unique_for_overwrite<char[]>(kPiece);
}

std::string faultAt(std::size_t offset, char const* reason) {
    return filled(localText("byte %s: "), {std::to_string(offset)}) + localText(reason);
}

// What is wrong with what the reader gives, if anything. The bytes are never there as a whole.
Failure decodeAll(tzhost::FileReader& reader, std::wstring& text) {
    auto const piece = makePiece();
    text.reserve(reader.expectedSize());
    std::size_t kept = 0;  // bytes of a character that the last piece cut in two
    std::size_t offset = 0;
    while (std::size_t const count = reader.read(piece.get() + kept, kPiece - kept)) {
        std::string_view const bytes(piece.get(), kept + count);
        Decoded const decoded = decodeText(bytes, text);
        offset += decoded.size;
        if (decoded.fault) return faultAt(offset, decoded.fault);
        kept = bytes.size() - decoded.size;
        std::copy(bytes.end() - static_cast<std::ptrdiff_t>(kept), bytes.end(), piece.get());
    }
    if (reader.hasFailed()) return localText("cannot be read") + ": " + tzhost::systemReason();
    return kept > 0 ? Failure(faultAt(offset, kNotUtf8)) : Failure();
}

Failure takeAll(tzhost::FileReader& reader, std::string& bytes) {
    bytes.reserve(reader.expectedSize());
    auto const piece = makePiece();
    while (std::size_t const count = reader.read(piece.get(), kPiece))
        bytes.append(piece.get(), count);
    return reader.hasFailed() ? localText("cannot be read") + ": " + tzhost::systemReason()
                              : Failure();
}

// What `take` finds wrong with a file that it reads, under the name of the file.
template <class Take, class Content>
Failure readFile(Take take, std::string const& file, Content& content) {
    Failure fault;
    if (file == "-") {
        tzhost::FileReader standardInput;
        fault = take(standardInput, content);
    } else {
        tzhost::FileReader reader(file);
        fault = take(reader, content);
    }
    if (fault) return shownName(file) + ": " + *fault;
    return {};
}

Failure writeStandardOutput(std::string_view bytes) {
    if (tzhost::writeStandardOutput(bytes)) return {};
    return localText("standard output") + ": " + tzhost::systemReason();
}

}  // namespace

void tell(std::string const& line) {
    std::fprintf(stderr, "tzconvert: %s\n",
                 tzhost::visible(line, tzhost::LineFeeds::shown).c_str());
}

std::string shownName(std::string const& file) {
    return file == "-" ? localText("standard input") : file;
}

Failure readText(std::string const& file, std::wstring& text) {
    return readFile(decodeAll, file, text);
}

Failure readBytes(std::string const& file, std::string& bytes) {
    return readFile(takeAll, file, bytes);
}

Failure writeText(std::wstring_view text) {
    std::string bytes;
    bytes.reserve(kPiece * 4);
    while (!text.empty()) {
        bytes.clear();
        encodeText(text.substr(0, kPiece), bytes);
        text.remove_prefix(std::min(text.size(), kPiece));
        if (Failure const failure = writeStandardOutput(bytes)) return failure;
    }
    return {};
}

Failure writeBytes(std::string const& file, std::string_view bytes) {
    if (file.empty()) return writeStandardOutput(bytes);
    if (tzhost::writeFileSafely(file, bytes)) return {};
    return notWritten(file, tzhost::systemReason());
}

Failure notWritten(std::string const& file, std::string const& reason) {
    return file + ": " + localText("cannot be written") + ": " + reason;
}

}  // namespace tzconvert
