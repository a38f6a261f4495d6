#include "tests/resources/texts_in_code.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <regex>

#include "host/text/text_escapes.h"
#include "host/text/utf8.h"

namespace {

namespace fs = std::filesystem;
using Words = std::sregex_iterator;

std::string contentsOf(fs::path const& file) {
    std::ifstream in(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
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

std::regex const& marked() {
    static std::regex const kMarked(
        R"re(\b(?:localText|forLocalText)\(\s*((?:L?"(?:[^"\\]|\\.)*"\s*)+)\))re");
    return kMarked;
}

// Calls `look` with each source file of the host and of its programs.
template <class Look>
void forEachHostSource(Look look) {
    fs::path const source(std::getenv("TZ_TEST_SOURCE"));
    for (char const* const folder : {"apps", "host"}) {
        for (fs::directory_entry const& entry : fs::recursive_directory_iterator(source / folder)) {
            std::string const ending = entry.path().extension();
            if (ending == ".cpp" || ending == ".h") look(entry.path());
        }
    }
}

// Two words in small letters make a text; comments and what is included are none.
void addUnmarked(fs::path const& file, std::vector<TextInCode>& texts) {
    static std::regex const kText(R"re("(?:[^"\\\n]|\\.)*"(?:\s*"(?:[^"\\\n]|\\.)*")*)re");
    static std::regex const kWords("[a-z]{2} [a-z]{2}");
    static std::regex const kComment(R"re((^|\s)//[^\n]*)re");
    std::string const code =
        std::regex_replace(std::regex_replace(contentsOf(file), kComment, ""), marked(), "");
    for (Words text(code.begin(), code.end(), kText), end; text != end; ++text)
        if (std::regex_search(text->str(), kWords))
            texts.push_back({file.filename().string(), meantBy(text->str())});
}

}  // namespace

std::set<std::wstring> hostTextsInCode() {
    std::set<std::wstring> texts;
    forEachHostSource([&](fs::path const& file) {
        std::string const source = contentsOf(file);
        for (Words use(source.begin(), source.end(), marked()), end; use != end; ++use)
            texts.insert(meantBy((*use)[1]));
    });
    return texts;
}

std::vector<TextInCode> unmarkedTextsInCode() {
    std::vector<TextInCode> texts;
    forEachHostSource([&](fs::path const& file) { addUnmarked(file, texts); });
    return texts;
}
