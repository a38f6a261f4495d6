#pragma once

// Which texts the host's source asks for.

#include <set>
#include <string>
#include <vector>

// The texts that the source of the host and of its programs marks for translation.
[[nodiscard]] std::set<std::wstring> hostTextsInCode();

struct TextInCode {
    std::string file;  // its name without folders
    std::wstring text;
};
// Texts there that read like English and are not marked.
[[nodiscard]] std::vector<TextInCode> unmarkedTextsInCode();
