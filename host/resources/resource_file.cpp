#include "host/resources/resource_file.h"

#include "host/text/utf8.h"

namespace tzhost {

namespace {

constexpr std::string_view kMagic = "TZRS";
constexpr std::uint32_t kVersion = 1;
// Offsets of the numbers in the head.
constexpr std::size_t kVersionAt = 4;
constexpr std::size_t kLengthAt = 8;
constexpr std::size_t kChecksumAt = 12;
constexpr std::size_t kCountAt = 16;
constexpr std::size_t kHeadSize = 20;
constexpr std::size_t kEntrySize = 12;

void append(std::string& bytes, std::uint32_t number) {
    for (int shift = 0; shift < 32; shift += 8)
        bytes += static_cast<char>((number >> shift) & 0xFF);
}

std::uint32_t numberAt(std::string_view bytes, std::size_t at) {
    std::uint32_t number = 0;
    for (std::size_t i = 4; i-- > 0;) {
        number = (number << 8) | static_cast<unsigned char>(bytes[at + i]);
    }
    return number;
}

std::uint32_t checksum(std::string_view bytes) {
    std::uint32_t sum = 2166136261U;
    for (char const c : bytes)
        sum = (sum ^ static_cast<unsigned char>(c)) * 16777619U;
    return sum;
}

}  // namespace

std::string writeResourceFile(ResourceTexts const& texts) {
    std::string entries;
    std::string contents;
    append(entries, static_cast<std::uint32_t>(texts.size()));
    std::size_t const start = kHeadSize + texts.size() * kEntrySize;
    for (auto const& [id, text] : texts) {
        std::string const bytes = toUtf8(text);
        append(entries, id);
        append(entries, static_cast<std::uint32_t>(start + contents.size()));
        append(entries, static_cast<std::uint32_t>(bytes.size()));
        contents += bytes;
    }
    std::string const body = entries + contents;
    std::string file(kMagic);
    append(file, kVersion);
    append(file, static_cast<std::uint32_t>(kCountAt + body.size()));
    append(file, checksum(body));
    return file + body;
}

std::optional<ResourceFile> ResourceFile::fromBytes(std::string bytes) {
    ResourceFile file(std::move(bytes));
    if (!file.isWhole() || !file.hasGoodEntries()) return std::nullopt;
    return file;
}

bool ResourceFile::isWhole() const {
    std::string_view const bytes = bytes_;
    return bytes.size() >= kHeadSize && bytes.substr(0, kMagic.size()) == kMagic &&
           numberAt(bytes, kVersionAt) == kVersion && numberAt(bytes, kLengthAt) == bytes.size() &&
           numberAt(bytes, kChecksumAt) == checksum(bytes.substr(kCountAt));
}

bool ResourceFile::hasGoodEntries() const {
    if (count() > (bytes_.size() - kHeadSize) / kEntrySize) return false;
    std::size_t const start = kHeadSize + count() * kEntrySize;
    for (std::uint32_t i = 0; i < count(); ++i) {
        Entry const entry = entryAt(i);
        if (i > 0 && entry.id <= entryAt(i - 1).id) return false;
        if (entry.offset < start || entry.offset > bytes_.size()) return false;
        if (entry.length > bytes_.size() - entry.offset) return false;
        if (firstBadByte(bytesOf(entry)) != kAllUtf8) return false;
    }
    return true;
}

std::uint32_t ResourceFile::count() const {
    return numberAt(bytes_, kCountAt);
}

ResourceFile::Entry ResourceFile::entryAt(std::uint32_t index) const {
    std::size_t const at = kHeadSize + index * kEntrySize;
    return {numberAt(bytes_, at), numberAt(bytes_, at + 4), numberAt(bytes_, at + 8)};
}

std::string_view ResourceFile::bytesOf(Entry const& entry) const {
    return std::string_view(bytes_).substr(entry.offset, entry.length);
}

std::optional<std::wstring> ResourceFile::find(std::uint32_t id) const {
    std::uint32_t low = 0;
    for (std::uint32_t high = count(); low < high;) {
        std::uint32_t const middle = low + (high - low) / 2;
        Entry const entry = entryAt(middle);
        if (entry.id == id) return fromUtf8(bytesOf(entry));
        if (entry.id < id) {
            low = middle + 1;
        } else {
            high = middle;
        }
    }
    return std::nullopt;
}

ResourceTexts ResourceFile::all() const {
    ResourceTexts texts;
    for (std::uint32_t i = 0; i < count(); ++i) {
        Entry const entry = entryAt(i);
        texts.emplace(entry.id, fromUtf8(bytesOf(entry)));
    }
    return texts;
}

}  // namespace tzhost
