#pragma once

// The binary form of a resource library, which its generator writes and TzRxResourceInstance reads.
// All numbers are 32 bits, low byte first:
//
//   "TZRS", version (1), length of the whole file, checksum of what follows, number of texts,
//   for each text, ascending by id: id, offset of the text from the file's start, its bytes,
//   the texts in UTF-8
//
// The checksum is FNV-1a. A file is refused whole when its version, length or checksum differs, or
// when its ids or offsets are out of order.

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>

namespace tzhost {

using ResourceTexts = std::map<std::uint32_t, std::wstring>;

[[nodiscard]] std::string writeResourceFile(ResourceTexts const& texts);

// The texts of one library, as its file holds them.
class ResourceFile {
public:
    // Nothing when the bytes are not a whole library.
    [[nodiscard]] static std::optional<ResourceFile> fromBytes(std::string bytes);

    // The text under an id; nothing when there is none.
    [[nodiscard]] std::optional<std::wstring> find(std::uint32_t id) const;
    [[nodiscard]] ResourceTexts all() const;

private:
    struct Entry {
        std::uint32_t id;
        std::uint32_t offset;
        std::uint32_t length;
    };

    explicit ResourceFile(std::string bytes) : bytes_(std::move(bytes)) {}
    [[nodiscard]] std::uint32_t count() const;
    [[nodiscard]] Entry entryAt(std::uint32_t index) const;
    [[nodiscard]] std::string_view bytesOf(Entry const& entry) const;
    [[nodiscard]] bool isWhole() const;
    [[nodiscard]] bool hasGoodEntries() const;

    std::string bytes_;
};

}  // namespace tzhost
