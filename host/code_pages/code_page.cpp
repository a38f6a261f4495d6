#include "tz/text/code_page.h"

#include "host/code_pages/code_page_converter.h"
#include "host/code_pages/code_page_table.h"

Charset TzCodePage::SysCharset() {
    return tzhost::charsetOf(tzhost::systemCodePage());
}

code_page_id TzCodePage::CharSetToCodePageId(Charset charset) {
    int const page = tzhost::codePageOf(charset);
    return static_cast<code_page_id>(page == 0 ? tzhost::systemCodePage() : page);
}

Charset TzCodePage::CodePageIdToCharSet(code_page_id page) {
    return tzhost::charsetOf(page);
}

bool TzCharacterCheck::IsLeadByte(code_page_id page, unsigned char byte) {
    return tzhost::isLeadByte(tzhost::usablePage(page), byte);
}

bool UnicodeConvert::multibyteToWide(code_page_id_ex page,
                                     std::string const& bytes,
                                     CStdStrW& text) {
    auto const decoded = tzhost::decode(page.number(), bytes);
    text = decoded.value_or(std::wstring());
    return decoded.has_value();
}

std::string UnicodeConvert::wideToMultibyte(code_page_id_ex page, std::wstring const& text) {
    return tzhost::encode(page.number(), text);
}

code_page_id_ex Locale::getSystemCodePageIdEx() {
    return tzhost::systemCodePage();
}
