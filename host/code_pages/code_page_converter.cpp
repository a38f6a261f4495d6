#include "host/code_pages/code_page_converter.h"

#include <array>
#include <map>

#include <iconv.h>

#include "host/code_pages/code_page_table.h"

namespace tzhost {

namespace {

// One open converter of iconv.
class Converter {
public:
    Converter(char const* to, char const* from) : handle_(::iconv_open(to, from)) {}
    ~Converter() {
        if (isOpen()) ::iconv_close(handle_);
    }
    Converter(Converter const&) = delete;
    Converter& operator=(Converter const&) = delete;

    [[nodiscard]] bool isOpen() const {
        return handle_ != reinterpret_cast<iconv_t>(-1);  // what iconv_open returns when it fails
    }

    // Converts the `size` bytes at `from`, which must be whole characters, and writes them to `to`,
    // which has `room` bytes. Earlier calls have no effect on it. Returns how many bytes were
    // written, or nothing when a character cannot be converted, or only to a substitute.
    std::optional<std::size_t> run(char* from, std::size_t size, char* to, std::size_t room) const {
        std::size_t const before = room;
        ::iconv(handle_, nullptr, nullptr, nullptr, nullptr);
        if (::iconv(handle_, &from, &size, &to, &room) != 0 || size != 0) return std::nullopt;
        ::iconv(handle_, nullptr, nullptr, &to, &room);
        return before - room;
    }

private:
    iconv_t handle_;
};

// Both directions of one page. Opened once and kept, as opening costs far more than a character;
// the characters of a single byte stand in a table.
class Page {
public:
    explicit Page(int number) : Page(number, iconvNameOf(number)) {}

    [[nodiscard]] bool isKnown() const { return toText_.isOpen() && toBytes_.isOpen(); }
    // The character of a single byte, or kNone.
    [[nodiscard]] wchar_t single(char byte) const {
        return singles_[static_cast<unsigned char>(byte)];
    }
    static constexpr wchar_t kNone = -1;

    // Appends the text of the bytes; false, with the text as it was, when the bytes are no
    // characters of the page.
    bool decode(std::string_view bytes, std::wstring& text) const {
        std::wstring room(bytes.size() + 1, L'\0');
        std::string source(bytes);
        // iconv writes wide characters as bytes.
        auto const written =
            toText_.run(source.data(), source.size(), reinterpret_cast<char*>(room.data()),
                        room.size() * sizeof(wchar_t));
        if (!written) return false;
        text.append(room, 0, *written / sizeof(wchar_t));
        return true;
    }

    // Appends the bytes of one character; false when the page lacks it.
    bool encode(wchar_t c, std::string& bytes) const {
        std::array<char, 16> room{};
        // iconv reads wide characters as bytes.
        auto const written =
            toBytes_.run(reinterpret_cast<char*>(&c), sizeof c, room.data(), room.size());
        if (written) bytes.append(room.data(), *written);
        return written.has_value();
    }

private:
    Page(int number, std::string const& name)
        : toText_("WCHAR_T", name.c_str()), toBytes_(name.c_str(), "WCHAR_T") {
        for (int byte = 0; byte < 0x100; ++byte) {
            auto const at = static_cast<std::size_t>(byte);
            std::wstring text;
            bool const isAlone =
                byte >= 0x80 && !isLeadByte(number, static_cast<unsigned char>(byte));
            bool const isRead =
                isAlone && isKnown() && decode(std::string(1, static_cast<char>(byte)), text);
            singles_[at] = isRead && text.size() == 1 ? text[0] : byte < 0x80 ? byte : kNone;
        }
    }

    Converter toText_;
    Converter toBytes_;
    std::array<wchar_t, 0x100> singles_{};
};

Page const& pageOf(int number) {
    static std::map<int, Page> pages;
    return pages.try_emplace(number, number).first->second;
}

bool isAscii(char byte) {
    return static_cast<unsigned char>(byte) < 0x80;
}

// How many bytes at the start of `bytes` are decoded together when the first one is no character by
// itself: a lead byte with its trail byte, or, in a page whose characters may have any length, all
// bytes before the next ASCII character.
std::size_t lengthOfCharacters(int page, std::string_view bytes) {
    std::size_t const most = hasLeadBytes(page) ? 2 : bytes.size();
    std::size_t count = 1;
    while (count < most && count < bytes.size() && (most == 2 || !isAscii(bytes[count])))
        ++count;
    return count;
}

}  // namespace

int usablePage(int codePage) {
    auto const isUsable = [](int page) { return page != kUtf8CodePage && pageOf(page).isKnown(); };
    if (codePage > 0 && isUsable(codePage)) return codePage;
    int const system = systemCodePage();
    return isUsable(system) ? system : kDefaultCodePage;
}

std::optional<std::wstring> decode(int codePage, std::string_view bytes) {
    int const number = usablePage(codePage);
    Page const& page = pageOf(number);
    std::wstring text;
    while (!bytes.empty()) {
        wchar_t const single = page.single(bytes[0]);
        if (single != Page::kNone) {
            text += single;
            bytes.remove_prefix(1);
            continue;
        }
        std::size_t const count = lengthOfCharacters(number, bytes);
        if (!page.decode(bytes.substr(0, count), text)) return std::nullopt;
        bytes.remove_prefix(count);
    }
    return text;
}

std::string encode(int codePage, std::wstring_view text) {
    Page const& page = pageOf(usablePage(codePage));
    std::string bytes;
    bytes.reserve(text.size());
    for (wchar_t const c : text) {
        if (c >= 0 && c < 0x80) {
            bytes += static_cast<char>(c);
        } else if (!page.encode(c, bytes)) {
            bytes += '?';
        }
    }
    return bytes;
}

}  // namespace tzhost
