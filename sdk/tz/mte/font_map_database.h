#pragma once

#include "tz/export.h"
#include "tz/mte/font_map_catalogue.h"
#include "tz/text/charset.h"
#include "tz/text/std_str.h"
#include "tz/text/string.h"

// Translates font files (a `.shx` file, or a pair with a big-font file) into typefaces and back, so
// that a font survives a trip through an editor that knows only typefaces: by the font map file,
// else by the host's font service, else by a proxy face that is lent to the file.
//
//   CMTextFontMapDatabase fonts(0);
//   CMTextFontMapDatabase::MapType type;
//   bool bold, italic; Charset charset; int pitch;
//   CStdStrW face = fonts.MapFileToFont(type, L"romans.shx", bold, italic, charset, pitch);
//   CStdStrW file = fonts.MapFontToFile(type, face, bold, italic, charset, pitch);
//   // "romans.shx" again
//
// The tables are shared by the process; the count of proxies belongs to one object. The end of any
// object takes the proxies of all of them out of the tables. No failure is reported: without a
// usable map file the font service and the proxies answer.

// A control that lists fonts, supplied by whoever calls FixupFontBox. Operations in slot order.
class TZ_API CMTextFontList {
public:
    virtual void AddShxFont(CStdStrW const& face) = 0;
    virtual void AddSystemFont(CStdStrW const& face) = 0;  // not called by the module
    virtual void AddMiscFont(CStdStrW const& face) = 0;
    virtual void AddAssignedProxy(CStdStrW const& face, CStdStrW file) = 0;
    virtual void AddFreeProxy(CStdStrW const& face) = 0;
    virtual ~CMTextFontList() = default;
};

class TZ_API CMTextFontMapDatabase : public CTzadFontMapDatabase {
public:
    // Where an entry comes from. MapTypeAll is for the remove operations alone; there MapTypeSystem
    // means every entry too.
    enum MapType : int {
        MapTypeAll = -1,
        MapTypeSystem = 0,  // no entry: the answer of the font service
        MapTypeShx = 1,
        MapTypeProxy = 2,
        MapTypePostscript = 3,
        MapTypeMisc = 4,
    };

    // Reads the face that is lent to pairs from the font map file. The flag passes to LoadContents,
    // which ignores it.
    explicit CMTextFontMapDatabase(signed char flag);
    ~CMTextFontMapDatabase() override;
    using CTzadFontMapDatabase::MapFileToFont;
    using CTzadFontMapDatabase::MapFontToFile;

    // Reads the three mapping sections of the font map file into the tables, over what is there.
    void BuildDatabase();
    // The face of a file or of a pair joined by a comma. A file without a comma for which nothing
    // knows a face is lent a proxy: the type is then MapTypeProxy, and all other outputs stay as
    // the font service left them.
    CStdStrW MapFileToFont(
        MapType& type, CStdStrW file, bool& bold, bool& italic, Charset& charset, int& pitch);
    // The file of exactly that description; else what the font service says of face, bold and
    // italic, which may be empty.
    CStdStrW
    MapFontToFile(MapType& type, CStdStrW face, bool bold, bool italic, Charset charset, int pitch);
    // Enters a pair into the tables, the second of them unless `oneWay`; a later entry takes an
    // earlier one's place. Always true.
    bool AddFontSubstitute(CStdStrW file,
                           CStdStrW face,
                           bool bold,
                           bool italic,
                           Charset charset,
                           int pitch,
                           MapType type,
                           signed char oneWay);
    void RemoveFileToFontMapEntries(MapType type);
    void RemoveFontToFileMapEntries(MapType type);
    // Offers the mapped faces, and the proxies that nothing has taken, to a list.
    void FixupFontBox(CMTextFontList* list);
    // Lends the big-font face to a pair in advance.
    void SetBigfont(CStdStrW file, CStdStrW big);
    void SetBigfont(CStdStrW spec);
    // Whether a text names a pair: whether it holds a comma.
    [[nodiscard]] static bool IsBigfontFilespec(CStdStrW const& spec);

    // Proxies. Faces come from section "Proxy Fonts" of the font map file, read anew on each call.
    [[nodiscard]] CStdStrW GetProxyTypeFace(int index) const;
    [[nodiscard]] CStdStrW GetEmergencyProxy() const;
    // The next proxy for a file, or the emergency face when none is left. Counts in either case.
    CStdStrW AddProxy(CStdStrW file);
    // The one face of all pairs. The last argument is unused.
    CStdStrW AddBigfontProxy(CStdStrW file, CStdStrW big, signed char unused = 0);
    CStdStrW AddBigfontProxy(CStdStrW spec, signed char unused = 0);
    [[nodiscard]] bool ProxiesAssigned() const { return m_nProxiesAssigned != 0; }
    [[nodiscard]] bool ProxiesExhausted() const { return m_bProxiesExhausted; }
    [[nodiscard]] bool IsBigfontProxyFont(CStdStrW const& face) const;

private:
    TzString m_sBigfontProxy;
    int m_nProxiesAssigned = 0;
    bool m_bProxiesExhausted = false;
};

// The entries that the class above stores.
class TZ_API CMTextFileToFontMapEntry : public IFileToFontMapEntry {
public:
    bool m_bBold = false;
    bool m_bItalic = false;
    Charset m_eCharset = kAnsiCharset;
    int m_nPitch = 0;
    CStdStrW m_sFaceName;  // in the case that the map file gave it
    CMTextFontMapDatabase::MapType m_eMapType = CMTextFontMapDatabase::MapTypeSystem;
};

class TZ_API CMTextFontToFileMapEntry : public IFontToFileMapEntry {
public:
    CStdStrW m_sFileName;  // the key of the matching entry of the other table
    CMTextFontMapDatabase::MapType m_eMapType = CMTextFontMapDatabase::MapTypeSystem;
};

// "face|b0|i0|c0|p0" in lower case: the key of a face in the table.
[[nodiscard]] TZ_API CStdStrW
BuildFontDescription(CStdStrW face, bool bold, bool italic, Charset charset, int pitch);

// Entry points that have nothing to ask here: the first leaves its outputs alone and gives true,
// the second says yes to every charset, the third does nothing.
TZ_API bool GetOsFontInfo(CStdStrW const& face, Charset& charset, int& pitch);
TZ_API int font_supports_charset(wchar_t const* face, int charset);
TZ_API void find_supporting_font(int charset, CStdStrW& face, int& pitch);

// [any] The tables' place in the life of the module: they outlive the objects that fill and empty
// them. The module loads them at its load, which reads the big-font proxy alone, and empties them
// at its unload.
TZ_API void LoadFontDatabase();
TZ_API void UnloadFontDatabase();
// [any] LoadFontDatabase in the form of a thread's entry; always 0. No thread of the module's runs
// it.
TZ_API int FontDatabaseLoader(void* unused);
