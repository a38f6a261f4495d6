// Any bytes as a font map file, asked for fonts both ways. Holds when what a file maps to has no
// more letters than there are, and the tables are empty again at the end.
#include <cstddef>
#include <cstdint>
#include <cstdlib>

#include "fuzz/markup/memory_file.h"
#include "host/fonts/font_map_path.h"
#include "tz/mte/font_map_database.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    static markupfuzz::MemoryFile file;
    file.write(data, size);
    tzhost::setFontMapFile(file.path());
    CMTextFontMapDatabase fonts(0);
    for (wchar_t const* const name : {L"a", L"txt.shx", L"C:\\x\\a.shx", L"a,b", L"none", L","}) {
        auto type = CMTextFontMapDatabase::MapTypeSystem;
        bool bold = false;
        bool italic = false;
        Charset charset = kAnsiCharset;
        int pitch = 0;
        CStdStrW const face = fonts.MapFileToFont(type, name, bold, italic, charset, pitch);
        if (face.size() > size + 100) std::abort();
        (void)fonts.MapFontToFile(type, face, bold, italic, charset, pitch);
    }
    fonts.ResetContents();
    return 0;
}
