#include "host/rtf/byte_text.h"

#include <algorithm>
#include <iterator>

#include "host/code_pages/code_page_converter.h"
#include "host/code_pages/code_page_table.h"
#include "host/rtf/symbol_faces.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

// The pages of documents. Each that is used costs a converter for the rest of the process, so
// that not any number may name one.
constexpr int kPages[] = {
    42,    437,   708,   709,   710,   711,   720,   737,   775,   819,   850,   852,
    855,   857,   858,   860,   861,   862,   863,   864,   865,   866,   869,   874,
    932,   936,   949,   950,   1250,  1251,  1252,  1253,  1254,  1255,  1256,  1257,
    1258,  1361,  10000, 10006, 10007, 10029, 10081, 20127, 20866, 21866, 28591, 28592,
    28593, 28594, 28595, 28596, 28597, 28598, 28599, 28603, 28605, 54936, 65001,
};
static_assert(std::is_sorted(std::begin(kPages), std::end(kPages)));

wchar_t widened(char byte) {
    return static_cast<wchar_t>(static_cast<unsigned char>(byte));
}

std::wstring widenedAll(std::string const& bytes) {
    std::wstring text;
    std::transform(bytes.begin(), bytes.end(), std::back_inserter(text), widened);
    return text;
}

std::size_t utf8Size(char first) {
    auto const lead = static_cast<unsigned char>(first);
    return lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : lead >= 0xC2 ? 2 : 1;
}

}  // namespace

bool RtfByteText::isKnown(int page) {
    return std::binary_search(std::begin(kPages), std::end(kPages), page);
}

void RtfByteText::usePage(int page) {
    page_ = page;
    hasLeadBytes_ = hasLeadBytes(page);
    auto const [at, isNew] = tables_.try_emplace(page);
    singles_ = &at->second;
    for (std::size_t byte = 0; isNew && byte < singles_->size(); ++byte) {
        char const c = static_cast<char>(byte);
        auto const text = decode(page, std::string_view(&c, 1));
        at->second[byte] = text && text->size() == 1 ? text->front() : widened(c);
    }
}

std::wstring RtfByteText::add(unsigned char byte, int page) {
    std::wstring text;
    if (page != page_) {
        text = end();
        usePage(page);
    }
    if (page == kSymbolPage) return text += kFirstSymbol + byte;
    if (page != kUtf8CodePage && !hasLeadBytes_) return text += (*singles_)[byte];
    bool const isBroken = page == kUtf8CodePage && isOpen() && (byte & 0xC0) != 0x80;
    if (isBroken) text += end();
    bytes_ += static_cast<char>(byte);
    return isUnfinished() ? text : text += end();
}

bool RtfByteText::isUnfinished() const {
    if (page_ == kUtf8CodePage) return bytes_.size() < utf8Size(bytes_.front());
    return bytes_.size() == 1 && isLeadByte(page_, static_cast<unsigned char>(bytes_.front()));
}

std::wstring RtfByteText::end() {
    if (bytes_.empty()) return {};
    std::string const bytes = std::move(bytes_);
    bytes_.clear();
    if (page_ == kUtf8CodePage)
        return firstBadByte(bytes) == kAllUtf8 ? fromUtf8(bytes) : widenedAll(bytes);
    return decode(page_, bytes).value_or(widenedAll(bytes));
}

}  // namespace tzhost
