#include "apps/tzconvert/machine.h"

#include <iconv.h>

#include "apps/options/language.h"
#include "apps/tzconvert/program_texts.h"
#include "host/code_pages/code_page_table.h"
#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"
#include "host/fonts/font_map_path.h"
#include "host/settings/variables.h"

namespace tzconvert {
namespace {

bool isKnownPage(int codePage) {
    iconv_t const page = ::iconv_open("UTF-8", tzhost::iconvNameOf(codePage).c_str());
    bool const isKnown = page != reinterpret_cast<iconv_t>(-1);
    if (isKnown) ::iconv_close(page);
    return isKnown;
}

// The map is read again for each conversion, so only a file will do.
Failure checkFontMap(std::string const& file) {
    if (tzhost::readFile(file)) return {};
    return file + ": " + localText("cannot be read") + ": " + tzhost::systemReason();
}

}  // namespace

Failure prepareMachine(Options const& options) {
    std::string const folder = tzhost::libraryFolder();
    if (Failure failure =
            tzapps::problemWithLanguage(options.locale, folder, tzapps::kLanguageFile))
        return failure;
    std::string const page = std::to_string(options.codePage);
    if (!isKnownPage(options.codePage))
        return filled(localText("--code-page %s is not known"), {page});
    auto const written = tzhost::Variables::instance().overrideFromText(
        L"SYSCODEPAGE", L"ANSI_" + std::to_wstring(options.codePage));
    if (!written.isDone()) return localText("--code-page cannot be set");
    if (options.fontMap.empty()) return {};
    if (Failure failure = checkFontMap(options.fontMap)) return failure;
    tzhost::setFontMapFile(options.fontMap);
    return {};
}

}  // namespace tzconvert
