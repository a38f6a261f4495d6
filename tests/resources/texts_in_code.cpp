#include "tests/resources/texts_in_code.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>
#include <regex>

#include "host/base/text_escapes.h"
#include "host/base/utf8.h"

namespace {

namespace fs = std::filesystem;
using Words = std::sregex_iterator;

std::string contentsOf(fs::path const& file) {
    std::ifstream in(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
}

// Constants of a file that are plain numbers, by name.
std::map<std::string, std::string> constantsOf(std::string const& source) {
    static std::regex const kConstant(R"(\b(k[A-Z]\w*)\s*=\s*(0x[0-9A-Fa-f]+|\d+)\b)");
    std::map<std::string, std::string> constants;
    for (Words word(source.begin(), source.end(), kConstant), end; word != end; ++word)
        constants[(*word)[1]] = (*word)[2];
    return constants;
}

// Expressions that choose a text or list keywords.
std::vector<std::string> textExpressions(std::string const& source) {
    static std::regex const kUses(
        R"(gStringTable\[([^\]]*)\]|loadResourceString\(([^()]*)\)|unsigned(?: int)?(?: const)? k?\w+\[\]\s*=?\s*\{([^}]*)\}|array<unsigned(?: int)?, \d+> \w+\s*=?\s*\{+([^}]*)\})");
    std::vector<std::string> expressions;
    for (Words use(source.begin(), source.end(), kUses), end; use != end; ++use) {
        for (std::size_t group = 1; group < use->size(); ++group)
            if ((*use)[group].matched) expressions.push_back((*use)[group]);
    }
    return expressions;
}

void addIds(fs::path const& file, std::vector<UsedText>& used) {
    static std::regex const kWord(R"(\b(0x[0-9A-Fa-f]+|\d+|k[A-Z]\w*)\b)");
    std::string const source = contentsOf(file);
    auto const constants = constantsOf(source);
    for (std::string const& expression : textExpressions(source)) {
        for (Words word(expression.begin(), expression.end(), kWord), end; word != end; ++word) {
            auto const constant = constants.find(word->str());
            std::string const number = constant == constants.end() ? word->str() : constant->second;
            if (number[0] == 'k') continue;
            used.push_back({static_cast<unsigned int>(std::stoul(number, nullptr, 0)),
                            file.filename().string()});
        }
    }
}

// What a text in the code stands for, its parts put together.
std::wstring meantBy(std::string const& literals) {
    static std::regex const kLiteral(R"re(L?"((?:[^"\\]|\\.)*)")re");
    std::string text;
    for (Words part(literals.begin(), literals.end(), kLiteral), end; part != end; ++part)
        text += (*part)[1].str();
    for (std::size_t at = text.find("\\\""); at != text.npos; at = text.find("\\\"", at + 1))
        text.erase(at, 1);
    return tzhost::unescaped(tzhost::fromUtf8(text)).value_or(L"");
}

void addHostTexts(std::string const& source, std::set<std::wstring>& texts) {
    static std::regex const kMarked(
        R"re(\b(?:localText|forLocalText)\(\s*((?:L?"(?:[^"\\]|\\.)*"\s*)+)\))re");
    for (Words use(source.begin(), source.end(), kMarked), end; use != end; ++use)
        texts.insert(meantBy((*use)[1]));
}

}  // namespace

std::set<std::wstring> hostTextsInCode() {
    std::set<std::wstring> texts;
    fs::path const source(std::getenv("TZ_TEST_SOURCE"));
    for (char const* const folder : {"apps/tzdraft", "host"})
        for (fs::directory_entry const& entry : fs::recursive_directory_iterator(source / folder))
            if (entry.path().extension() == ".cpp") addHostTexts(contentsOf(entry.path()), texts);
    return texts;
}

std::vector<UsedText> textsInCode() {
    std::vector<UsedText> used;
    fs::path const source(std::getenv("TZ_TEST_SOURCE"));
    for (fs::directory_entry const& entry : fs::recursive_directory_iterator(source / "module"))
        if (entry.path().extension() == ".cpp") addIds(entry.path(), used);
    return used;
}
