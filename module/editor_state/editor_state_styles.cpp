// The text styles that a session knows.

#include "module/host_calls/sys_code_page.h"
#include "module/styles/style_rules.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/db/symbol_table.h"
#include "tz/db/symbol_utilities.h"
#include "tz/mte/easy_object.h"
#include "tz/mte/editor_state.h"
#include "tz/text/code_page.h"

namespace {

bool isEastAsianPage(int page) {
    return page == kCodePage932 || page == kCodePage936 || page == kCodePage949 ||
           page == kCodePage950;
}

// A style with a big font names both files, as one text.
TzString fontFileOf(TzDbTextStyleTableRecord const& record) {
    TzString file = record.fileName();
    TzString const big = record.bigFontFileName();
    if (!big.isEmpty()) file += TzString(L",") + big;
    return file;
}

// What the record says; false when its font cannot be read.
bool GetStyleInfoFromDrawing(TzDbTextStyleTableRecord const& record, CStyleInfoEntry& entry) {
    int charset = 0;
    if (record.font(entry.typeface, entry.bold, entry.italic, charset, entry.pitchAndFamily) !=
        Tzad::eOk)
        return false;
    entry.name = record.getName();
    entry.fileName = fontFileOf(record);
    entry.height = record.textSize();
    entry.widthFactor = record.xScale();
    entry.charset = static_cast<Charset>(charset);
    return true;
}

// Gives a style that names a font file the face that stands for the file.
void takeFaceOfFile(CMTextFontMapDatabase& fonts, CStyleInfoEntry& entry) {
    CStdStrW const file(entry.fileName);
    CMTextFontMapDatabase::MapType type;
    entry.typeface = fonts
                         .MapFileToFont(type, file, entry.bold, entry.italic, entry.charset,
                                        entry.pitchAndFamily)
                         .c_str();
    bool const isPlain =
        isEastAsianPage(SysCodePage()) && !CMTextFontMapDatabase::IsBigfontFilespec(file);
    entry.charset = isPlain ? kAnsiCharset : TzCodePage::SysCharset();
}

}  // namespace

void CMTextEditorState::LoadStyles() {
    if (!m_aStyles.isEmpty()) return;
    TzDbDatabase* const database = tzdbHostApplicationServices()->workingDatabase();
    EasyTable<TzDbTextStyleTable> table;
    if (!database || database->getTextStyleTable(table.object, TzDb::kForRead) != Tzad::eOk) return;
    EasyIterator<TzDbTextStyleTable, TzDbTextStyleTableIterator> walk;
    if (table->newIterator(walk.object) != Tzad::eOk) return;
    for (; !walk->done(); walk->step()) {
        EasyObject<TzDbTextStyleTableRecord> record;
        CStyleInfoEntry entry;
        if (walk->getRecord(record.object, TzDb::kForRead) != Tzad::eOk ||
            !GetStyleInfoFromDrawing(*record.object, entry) ||
            entry.name.find(kExternalStyleMark) >= 0)
            continue;
        if (entry.typeface.isEmpty()) takeFaceOfFile(m_fontMap, entry);
        if (entry.height == 0.0) {
            entry.heightIsInitialSize = true;
            entry.height = GetInitialSize();
        }
        m_aStyles.append(entry);
    }
}

bool CMTextEditorState::FindStyle(CStdStrW const& name, int& index) const {
    auto const* const names = TzDbSymbolUtilities::servicesPtr();
    for (index = 0; index < m_aStyles.length(); ++index) {
        if (names->compareSymbolName(m_aStyles[index].name.kwszPtr(), name.c_str()) == 0)
            return true;
    }
    index = -1;
    return false;
}

bool CMTextEditorState::GetStyleInfo(int index, CStyleInfoEntry& entry) const {
    if (index < 0 || index >= m_aStyles.length()) return false;
    entry = m_aStyles[index];
    return true;
}

CStdStrW CMTextEditorState::GetStyleFontFileName(CStdStrW const* style) {
    LoadStyles();
    int index = -1;
    if (!FindStyle(style ? *style : m_sStyle, index)) return {};
    return m_aStyles[index].fileName;
}
