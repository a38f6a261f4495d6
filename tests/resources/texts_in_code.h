#pragma once

// Which texts the host's source asks for.

#include <set>
#include <string>
#include <vector>

// The texts that the source of the host and of its program marks for translation.
[[nodiscard]] std::set<std::wstring> hostTextsInCode();

// Texts there that read like English and are not marked, each "file: text".
[[nodiscard]] std::vector<std::string> unmarkedTextsInCode();
