#include "apps/tzconvert/machine.h"

#include <filesystem>

#include <iconv.h>

#include "host/code_pages/code_page_table.h"
#include "host/files/file_bytes.h"
#include "host/files/file_reader.h"
#include "host/fonts/font_map_path.h"
#include "host/settings/variables.h"

namespace tzconvert {
namespace {

namespace fs = std::filesystem;

bool isKnownPage(int codePage) {
    iconv_t const page = ::iconv_open("UTF-8", tzhost::iconvNameOf(codePage).c_str());
    bool const isKnown = page != reinterpret_cast<iconv_t>(-1);
    if (isKnown) ::iconv_close(page);
    return isKnown;
}

// What gives no bytes, gives them only once, or without end; null for a file or a folder.
char const* kindOf(std::string const& file) {
    std::error_code unknown;  // of a file that is not there, which opening it will tell
    switch (fs::status(file, unknown).type()) {
    case fs::file_type::fifo: return "a pipe";
    case fs::file_type::socket: return "a socket";
    case fs::file_type::character:
    case fs::file_type::block: return "a device";
    default: return nullptr;
    }
}

// The map is read again for each conversion, so only a file will do.
Failure checkFontMap(std::string const& file) {
    if (char const* const kind = kindOf(file)) return file + ": cannot be read: it is " + kind;
    tzhost::FileReader reader(file);
    char first = 0;
    (void)reader.read(&first, 1);  // a folder opens
    if (reader.hasFailed()) return file + ": cannot be read: " + tzhost::systemReason();
    return {};
}

}  // namespace

Failure prepareMachine(Options const& options) {
    std::string const page = std::to_string(options.codePage);
    if (!isKnownPage(options.codePage)) return "--code-page " + page + " is not known";
    auto const written = tzhost::Variables::instance().overrideFromText(
        L"SYSCODEPAGE", L"ANSI_" + std::to_wstring(options.codePage));
    if (!written.isDone()) return "--code-page cannot be set";
    if (options.fontMap.empty()) return {};
    if (Failure failure = checkFontMap(options.fontMap)) return failure;
    tzhost::setFontMapFile(options.fontMap);
    return {};
}

}  // namespace tzconvert
