#include "host/base/code_page_converter.h"

#include <array>
#include <map>

#include <iconv.h>

#include "host/base/code_page_table.h"

namespace tzhost {

namespace {

// Both directions of one page. Opened once and kept, as opening costs far more than a character.
class Page {
public:
    explicit Page(int number)
        : toText_(::iconv_open("WCHAR_T", iconvNameOf(number).c_str())),
          toBytes_(::iconv_open(iconvNameOf(number).c_str(), "WCHAR_T")) {}
    ~Page() {
        if (isOpen(toText_)) ::iconv_close(toText_);
        if (isOpen(toBytes_)) ::iconv_close(toBytes_);
    }
    Page(Page const&) = delete;
    Page& operator=(Page const&) = delete;

    [[nodiscard]] bool isKnown() const { return isOpen(toText_) && isOpen(toBytes_); }

    // Appends the text of the bytes; false, with the text as it was, when they are no characters.
    bool decode(std::string_view bytes, std::wstring& text) const {
        std::wstring room(bytes.size() + 1, L'\0');
        std::string source(bytes);
        char* in = source.data();
        std::size_t inLeft = source.size();
        char* out = reinterpret_cast<char*>(room.data());  // iconv writes wide characters as bytes
        std::size_t outLeft = room.size() * sizeof(wchar_t);
        ::iconv(toText_, nullptr, nullptr, nullptr, nullptr);
        if (::iconv(toText_, &in, &inLeft, &out, &outLeft) == kFailed || inLeft != 0) return false;
        ::iconv(toText_, nullptr, nullptr, &out, &outLeft);
        text.append(room, 0, room.size() - outLeft / sizeof(wchar_t));
        return true;
    }

    // Appends the bytes of one character; false when the page lacks it.
    bool encode(wchar_t c, std::string& bytes) const {
        std::array<char, 16> room{};
        char* in = reinterpret_cast<char*>(&c);  // iconv reads wide characters as bytes
        std::size_t inLeft = sizeof c;
        char* out = room.data();
        std::size_t outLeft = room.size();
        ::iconv(toBytes_, nullptr, nullptr, nullptr, nullptr);
        // More than 0 counts characters that were replaced by similar ones.
        if (::iconv(toBytes_, &in, &inLeft, &out, &outLeft) != 0) return false;
        ::iconv(toBytes_, nullptr, nullptr, &out, &outLeft);
        bytes.append(room.data(), room.size() - outLeft);
        return true;
    }

private:
    static constexpr auto kFailed = static_cast<std::size_t>(-1);
    static bool isOpen(iconv_t converter) {
        return converter != reinterpret_cast<iconv_t>(-1);  // as iconv_open fails
    }

    iconv_t toText_;
    iconv_t toBytes_;
};

Page const& pageOf(int number) {
    static std::map<int, Page> pages;
    return pages.try_emplace(number, number).first->second;
}

// The page that is read when this one is asked for.
int usablePage(int number) {
    auto const isUsable = [](int page) { return page != kUtf8CodePage && pageOf(page).isKnown(); };
    if (number > 0 && isUsable(number)) return number;
    int const system = systemCodePage();
    return isUsable(system) ? system : kDefaultCodePage;
}

bool isAscii(char byte) {
    return static_cast<unsigned char>(byte) < 0x80;
}

}  // namespace

std::optional<std::wstring> decode(int codePage, std::string_view bytes) {
    int const number = usablePage(codePage);
    Page const& page = pageOf(number);
    std::wstring text;
    while (!bytes.empty()) {
        std::size_t count = 1;
        if (isAscii(bytes[0])) {
            text += static_cast<wchar_t>(bytes[0]);
            bytes.remove_prefix(1);
            continue;
        }
        if (isLeadByte(number, static_cast<unsigned char>(bytes[0])) && bytes.size() > 1) {
            count = 2;
        } else if (!hasLeadBytes(number)) {
            while (count < bytes.size() && !isAscii(bytes[count]))
                ++count;
        }
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
