#include "module/fonts/table_key.h"
#include "tz/mte/font_map_database.h"

CStdStrW BuildFontDescription(CStdStrW face, bool bold, bool italic, Charset charset, int pitch) {
    return CStdStrW(descriptionKey(face, bold, italic, charset, pitch).view());
}
