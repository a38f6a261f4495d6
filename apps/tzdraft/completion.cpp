#include "apps/tzdraft/completion.h"

#include <algorithm>
#include <filesystem>
#include <iterator>

#include "apps/tzdraft/typed_file.h"
#include "host/text/case_table.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

enum class Case { counts, ignored };

bool isSame(wchar_t a, wchar_t b, Case letters) {
    return letters == Case::counts ? a == b : tzhost::lowerOf(a) == tzhost::lowerOf(b);
}

std::wstring lowered(std::wstring text) {
    for (wchar_t& each : text)
        each = tzhost::lowerOf(each);
    return text;
}

// How many characters the two have in common at their start.
std::size_t commonLength(std::wstring_view a, std::wstring_view b, Case letters) {
    std::size_t length = 0;
    while (length < std::min(a.size(), b.size()) && isSame(a[length], b[length], letters)) {
        ++length;
    }
    return length;
}

Completion complete(std::wstring_view start, std::vector<std::wstring> words, Case letters) {
    std::erase_if(words, [&](std::wstring const& word) {
        return commonLength(start, word, letters) < start.size();
    });
    Completion completion;
    if (words.empty()) return completion;
    std::size_t length = words.front().size();
    for (std::wstring const& each : words) {
        length = std::min(length, commonLength(words.front(), each, letters));
    }
    completion.insert = words.front().substr(start.size(), length - start.size());
    bool const isLower = !start.empty() && tzhost::upperOf(start.back()) != start.back();
    if (letters == Case::ignored && isLower)
        completion.insert = lowered(std::move(completion.insert));
    std::sort(words.begin(), words.end());
    if (words.size() > 1) completion.choices = std::move(words);
    return completion;
}

}  // namespace

Completion completeWord(std::wstring_view typed, std::vector<std::wstring> const& words) {
    return completeName(typed.substr(typed.find_last_of(L" \t") + 1), words);
}

Completion completeName(std::wstring_view typed, std::vector<std::wstring> const& names) {
    bool const isGlobal = typed.starts_with(L'_');
    std::vector<std::wstring> offered;
    std::copy_if(names.begin(), names.end(), std::back_inserter(offered),
                 [&](std::wstring const& name) { return name.starts_with(L'_') == isGlobal; });
    return complete(typed, std::move(offered), Case::ignored);
}

Completion completeFile(std::wstring_view typed, std::wstring_view home) {
    std::size_t const slash = typed.rfind(L'/');
    std::wstring_view const start =
        slash == std::wstring_view::npos ? typed : typed.substr(slash + 1);
    std::filesystem::path const folder =
        fileTyped(slash != std::wstring_view::npos ? typed.substr(0, slash + 1)
                  : home.empty()                   ? L"."
                                                   : home);
    std::vector<std::wstring> names;
    std::error_code unreadable;  // such a folder holds nothing to offer
    for (std::filesystem::directory_iterator each(folder, unreadable), end; each != end;
         each.increment(unreadable)) {
        std::wstring name = tzhost::fromUtf8(each->path().filename().string());
        if (name.starts_with(L'.') && !start.starts_with(L'.')) continue;
        std::error_code gone;
        if (each->is_directory(gone)) name += L'/';
        names.push_back(std::move(name));
    }
    return complete(start, std::move(names), Case::counts);
}

}  // namespace tzdraft
