#include "module/fonts/table_key.h"

#include <charconv>

namespace {

wchar_t lowerOf(wchar_t c) {
    // Most letters of names are ASCII; lowering them here saves a call of the host for each.
    if (c < 0x80) return c >= L'A' && c <= L'Z' ? c + (L'a' - L'A') : c;
    return tzToLower(c);
}

// Bold and italic as a description words them; the index is 2 * bold + italic.
constexpr std::wstring_view kStyles[] = {L"|b0|i0|c", L"|b0|i1|c", L"|b1|i0|c", L"|b1|i1|c"};

}  // namespace

void lowerKey(CStdStrW& key) {
    for (wchar_t& c : key)
        c = lowerOf(c);
}

void TableKey::add(std::wstring_view text) {
    if (long_.empty() && text.size() <= kShort - size_) {
        wchar_t* to = short_ + size_;
        for (wchar_t const c : text)
            *to++ = lowerOf(c);
        size_ += text.size();
        return;
    }
    if (long_.empty()) long_.assign(short_, size_);
    for (wchar_t const c : text)
        long_ += lowerOf(c);
}

void TableKey::add(int number) {
    char digits[16];
    wchar_t wide[16];
    char const* const end = std::to_chars(digits, digits + sizeof digits, number).ptr;
    std::size_t count = 0;
    for (char const* each = digits; each != end; ++each)
        wide[count++] = static_cast<wchar_t>(*each);
    add(std::wstring_view(wide, count));
}

std::wstring_view TableKey::view() const {
    return long_.empty() ? std::wstring_view(short_, size_) : std::wstring_view(long_);
}

TableKey
descriptionKey(std::wstring_view face, bool bold, bool italic, Charset charset, int pitch) {
    TableKey key;
    key.add(face);
    key.add(kStyles[(bold ? 2 : 0) + (italic ? 1 : 0)]);
    key.add(charset);
    key.add(L"|p");
    key.add(pitch);
    return key;
}
