// The tables of the other languages against the English texts: nothing left untranslated, formats
// that take the same arguments, words that can be told apart.

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <bit>
#include <cerrno>
#include <cstring>
#include <filesystem>
#include <map>
#include <set>

#include "host/command_line/keyword_list.h"
#include "host/files/file_bytes.h"
#include "host/resources/resource_table.h"
#include "host/text/format_conversions.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "module/texts/text_ids.h"
#include "tests/resources/texts_in_code.h"
#include "tz/text/string.h"

namespace {

namespace fs = std::filesystem;

fs::path resources() {
    return fs::path(std::getenv("TZ_TEST_SOURCE")) / "resources";
}

std::vector<std::string> languages() {
    std::vector<std::string> found;
    for (auto const& entry : fs::directory_iterator(resources()))
        if (entry.is_directory()) found.push_back(entry.path().filename());
    return found;
}

std::map<std::uint32_t, tzhost::ResourceRow> moduleTexts(std::string const& language) {
    std::string const file = (resources() / (language + ".txt")).string();
    tzhost::ResourceFaults faults;
    std::map<std::uint32_t, tzhost::ResourceRow> rows;
    for (auto const& row :
         tzhost::readResourceTable(file, tzhost::readFile(file).value_or(""), faults).rows)
        rows.emplace(row.id, row);
    EXPECT_EQ(faults, tzhost::ResourceFaults());
    return rows;
}

std::vector<tzhost::LocalTextRow> hostTexts(std::string const& language,
                                            char const* file = "tzdraft.texts") {
    std::vector<std::string> faults;
    auto const bytes = tzhost::readFile((resources() / language / file).string());
    auto rows = tzhost::readLocalTexts(bytes.value_or(""), faults);
    EXPECT_EQ(faults, std::vector<std::string>());
    return rows;
}

// What a keyword shows: its part before the global word.
std::wstring shownOf(tzhost::ResourceRow const& row) {
    bool const isKeyword = row.rules == tzhost::ResourceRules::keywords;
    return isKeyword ? row.text.substr(0, row.text.find(L" _")) : row.text;
}

// Names that are the same in other languages: commands and a kind of fonts; and abbreviations that
// happen to be.
constexpr std::uint32_t kSameNames[] = {1062, 1063, 144};
constexpr std::uint32_t kSameAbbreviations[] = {1051, 1053};

bool maybeSame(tzhost::ResourceRow const& row) {
    auto const holds = [&](auto const& ids) {
        return std::find(std::begin(ids), std::end(ids), row.id) != std::end(ids);
    };
    return row.rules == tzhost::ResourceRules::fixed || holds(kSameNames) ||
           holds(kSameAbbreviations);
}

// A command of the host: its name is in capitals.
bool isCommandName(std::wstring_view text) {
    return std::all_of(text.begin(), text.end(), [](wchar_t c) { return c >= L'A' && c <= L'Z'; });
}

// The table of ids in the code and the tables of all languages are the same whole.
TEST(ModuleTexts, HaveTheIdsOfTheCode) {
    using Ids = std::array<std::uint32_t, sizeof(TextIds) / sizeof(std::uint32_t)>;
    Ids ids = std::bit_cast<Ids>(kText);
    std::sort(ids.begin(), ids.end());
    std::vector<std::string> all = languages();
    all.push_back("en");
    for (std::string const& language : all) {
        std::vector<std::uint32_t> listed;
        for (auto const& [id, row] : moduleTexts(language)) {
            listed.push_back(id);
            EXPECT_FALSE(row.text.empty()) << language << " " << id;
        }
        EXPECT_EQ(listed, std::vector<std::uint32_t>(ids.begin(), ids.end())) << language;
    }
}

class Translations : public testing::TestWithParam<std::string> {};

TEST_P(Translations, SayEachModuleTextInTheirOwnWords) {
    auto const english = moduleTexts("en");
    auto const local = moduleTexts(GetParam());
    ASSERT_GT(english.size(), 100U);
    for (auto const& [id, row] : english) {
        ASSERT_EQ(local.count(id), 1U) << id;
        tzhost::ResourceRow const& other = local.at(id);
        EXPECT_EQ(tzhost::conversionsOf(other.text), tzhost::conversionsOf(row.text)) << id;
        EXPECT_TRUE(maybeSame(row) || shownOf(other) != shownOf(row)) << id;
    }
}

// What the system says is looked up too.
std::set<std::wstring> reasonsOfTheSystem() {
    std::set<std::wstring> reasons;
    for (int const reason : {ENOENT, EACCES,  EISDIR, ENOTDIR,   ENOSPC, EFBIG,      EROFS,
                             EIO,    ENOEXEC, EMFILE, ENOMEM,    EPIPE,  ELOOP,      ENAMETOOLONG,
                             EPERM,  ENXIO,   ENODEV, EBADF,     EBUSY,  EEXIST,     EINVAL,
                             ENFILE, ETXTBSY, ESTALE, ETIMEDOUT, EDQUOT, EOPNOTSUPP, E2BIG})
        reasons.insert(tzhost::fromUtf8(std::strerror(reason)));
    return reasons;
}

TEST_P(Translations, SayEachHostTextInTheirOwnWords) {
    std::set<std::wstring> used = hostTextsInCode();
    ASSERT_GT(used.size(), 150U) << "the search finds too little";
    used.merge(reasonsOfTheSystem());
    for (tzhost::LocalTextRow const& row : hostTexts(GetParam())) {
        EXPECT_EQ(used.erase(row.english), 1U) << row.line << ": no code shows this text";
        EXPECT_TRUE(isCommandName(row.english) || row.english != row.local) << row.line;
    }
    for (std::wstring const& each : used)
        ADD_FAILURE() << "not translated: " << tzhost::toUtf8(each);
}

// What nobody reads: the words of SVG and the names of keys' functions, faults of tables that
// translators write, a class registered twice, an operation's name, and what is cut out of messages
// of parsers.
constexpr std::string_view kNotShown[] = {
    "svg_writer.cpp", "terminal_source.cpp", "resource_table.cpp", "class_registry.cpp",
    "memory.cpp",     "json_parsers.cpp",    "local_text.cpp",     "usage.cpp"};

// The help of options has a table of its own.
TEST_P(Translations, KnowAllTextsThatAreShown) {
    std::set<std::wstring> helps;
    for (tzhost::LocalTextRow const& row : hostTexts(GetParam(), "options.texts"))
        helps.insert(row.english);
    for (auto const& [file, text] : unmarkedTextsInCode()) {
        bool const isShown = std::count(std::begin(kNotShown), std::end(kNotShown), file) == 0;
        EXPECT_TRUE(!isShown || helps.count(text) != 0) << file << ": " << tzhost::toUtf8(text);
    }
}

std::wstring capitalsOf(std::wstring const& word) {
    std::wstring capitals;
    std::copy_if(word.begin(), word.end(), std::back_inserter(capitals),
                 [](wchar_t c) { return tzToLower(c) != c; });
    return capitals;
}

// The keywords of the host's commands.
constexpr wchar_t const* kHostQuestions[] = {L"Yes No", L"Single Multiple",
                                             L"Make Set ON OFf Color LOck Unlock Delete ?",
                                             L"World X Y Z 3Point",
                                             L"Justify Left Center Right Middle TL TC TR ML MC "
                                             L"MR BL BC BR"};

TEST_P(Translations, HaveWordsThatAreToldApart) {
    std::map<std::wstring, std::wstring> texts;
    for (tzhost::LocalTextRow const& row : hostTexts(GetParam()))
        texts[row.english] = row.local;
    for (std::wstring const english : kHostQuestions) {
        std::wstring const list = texts[english] + L" _" + english;
        auto const words = tzhost::KeywordList::parse(list);
        ASSERT_TRUE(words) << tzhost::toUtf8(list);
        for (int index = 0; index < words->count(); ++index) {
            std::wstring const brief = capitalsOf(words->local(index));
            EXPECT_EQ(words->match(words->local(index)), index) << tzhost::toUtf8(list);
            EXPECT_EQ(words->match(L"_" + words->global(index)), index) << tzhost::toUtf8(list);
            EXPECT_TRUE(brief.empty() || words->match(brief) == index) << tzhost::toUtf8(list);
        }
    }
}

// No word of a selection hides another one, nor a keyword that TEXTALIGN adds to them.
TEST_P(Translations, HaveWordsForSelectingThatAreToldApart) {
    std::set<std::wstring> taken;
    std::wstring const added = shownOf(moduleTexts(GetParam()).at(57663));
    for (std::size_t at = 0; at < added.size(); at = added.find(L' ', at) + 1) {
        taken.insert(std::wstring(1, tzToLower(added[at])));
        if (added.find(L' ', at) == added.npos) break;
    }
    int count = 0;
    for (tzhost::LocalTextRow const& row : hostTexts(GetParam())) {
        std::size_t const blank = row.english.find(L' ');
        bool const isSelecting = blank != row.english.npos && row.english.size() - blank == 2 &&
                                 row.english[blank + 1] == row.english[0];
        if (!isSelecting) continue;
        ++count;
        std::size_t const gap = row.local.find(L' ');
        ASSERT_NE(gap, row.local.npos);
        EXPECT_TRUE(taken.insert(row.local.substr(gap + 1)).second) << tzhost::toUtf8(row.local);
        EXPECT_TRUE(taken.insert(row.local.substr(0, gap)).second) << tzhost::toUtf8(row.local);
    }
    EXPECT_EQ(count, 7) << "window, crossing, fence, last, previous, add and remove";
}

// Each command that HELP knows in English it knows in the language.
TEST_P(Translations, HelpOnTheSameCommands) {
    auto const topicsOf = [](fs::path const& file) {
        std::vector<std::string> topics;
        std::set<std::string> lines;
        std::string const bytes = tzhost::readFile(file.string()).value_or("") + "\n";
        for (std::size_t at = 0; at < bytes.size(); at = bytes.find('\n', at) + 1) {
            std::string const line = bytes.substr(at, bytes.find('\n', at) - at);
            if (line.starts_with('['))
                topics.push_back(line);
            else if (!line.empty())
                lines.insert(line);
        }
        return std::pair(topics, lines);
    };
    auto const [topics, lines] = topicsOf(resources() / "tzmted.help");
    auto const [localTopics, localLines] = topicsOf(resources() / GetParam() / "tzmted.help");
    EXPECT_GT(topics.size(), 5U);
    EXPECT_EQ(topics, localTopics);
    for (std::string const& line : lines)
        EXPECT_EQ(localLines.count(line), 0U) << line;
}

INSTANTIATE_TEST_SUITE_P(Languages,
                         Translations,
                         testing::ValuesIn(languages()),
                         [](auto const& row) { return row.param; });

}  // namespace
