#pragma once

// Which texts the module's source and the host's ask for.

#include <set>
#include <string>
#include <vector>

// One id, and the file that uses it.
struct UsedText {
    unsigned int id;
    std::string file;
};

// The ids that are written into the module's source: those between the brackets of gStringTable and
// loadResourceString, and those of keyword lists, as numbers or as constants of the same file.
[[nodiscard]] std::vector<UsedText> textsInCode();

// The texts that the source of the host and of its program marks for translation.
[[nodiscard]] std::set<std::wstring> hostTextsInCode();

// Texts there that read like English and are not marked, each "file: text".
[[nodiscard]] std::vector<std::string> unmarkedTextsInCode();
