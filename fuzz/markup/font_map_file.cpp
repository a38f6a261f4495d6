// Any bytes as a font map file, asked for fonts both ways. Holds when what a file maps to has no
// more letters than there are, and the tables are empty again at the end.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

#include "host/base/file_bytes.h"
#include "host/base/font_map_path.h"
#include "tz/mte/font_map_database.h"

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::string const file = "font_map_file.ini";
    if (!tzhost::writeFileSafely(file, std::string(data, data + size))) std::abort();
    std::string const before = tzhost::setFontMapFile(file);
    {
        CMTextFontMapDatabase fonts(0);
        fonts.ResetContents();
        for (wchar_t const* const name :
             {L"a", L"txt.shx", L"C:\\x\\a.shx", L"a,b", L"none", L","}) {
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
    }
    tzhost::setFontMapFile(before);
    return 0;
}
