#pragma once

#include <map>
#include <mutex>

#include "tz/export.h"
#include "tz/mte/font_map_entries.h"
#include "tz/text/std_str.h"
#include "tz/text/string.h"

// The two process-wide tables that relate font files to typefaces, and the catalogue's read access
// to them. CMTextFontMapDatabase derives from this and does all the filling; the read operations
// here expect the richer entries of tz/mte/font_map_entries.h and must not be used on tables that
// it has filled.
//
// Everything but the load status is for the host's one thread; m_mutexLoading covers the change of
// the status and the clearing of the tables, no look-up and no insertion.
class TZ_API CTzadFontMapDatabase {
public:
    enum DatabaseStatus : int { kNotLoaded = 0, kLoading = 1, kLoaded = 2 };
    using FileToFontMap = std::map<CStdStrW, IFileToFontMapEntry*, std::less<>>;
    using FontToFileMap = std::map<CStdStrW, IFontToFileMapEntry*, std::less<>>;

    // Loads the tables unless they are loaded; the argument passes to LoadContents.
    explicit CTzadFontMapDatabase(signed char flag);
    CTzadFontMapDatabase(CTzadFontMapDatabase const&) = delete;
    CTzadFontMapDatabase& operator=(CTzadFontMapDatabase const&) = delete;
    virtual ~CTzadFontMapDatabase();

    // The face of a file. When the file is not in the table, the face is empty and everything else
    // 0.
    virtual CStdStrW
    MapFileToFont(CStdStrW file, bool& bold, bool& italic, int& charset, int& family);
    // The file of a face's form, empty when it is not in the table; "@" before the face does not
    // count, nor do the two numbers.
    virtual CStdStrW MapFontToFile(CStdStrW face, bool bold, bool italic, int charset, int family);
    // Write both tables, or one, into sections "Fonts to Files" and "Files to Fonts" of an INI
    // file, for developers; without `append` the section is emptied first.
    virtual void WriteDatabaseToDisk(wchar_t const* file, signed char append);
    virtual void WriteFontToFileMapToDisk(wchar_t const* file, signed char append);
    virtual void WriteFileToFontMapToDisk(wchar_t const* file, signed char append);
    virtual bool IsDatabaseLoaded();
    // Sets the status; the argument is ignored. The tables fill at the first look-up of the derived
    // class.
    virtual void LoadContents(signed char flag);
    // Empties both tables; the status is that of the start.
    virtual void ResetContents();
    // Which forms of a face have to be synthesised; any pointer may be null. False, with nothing
    // written, for an unknown face.
    [[nodiscard]] virtual bool
    GetFontSynthesisInfo(CStdStrW face, bool* bold, bool* italic, bool* boldItalic);

    // Where a system of that kind lists its fonts.
    static void InitSystemLocations();
    static TzString GetSystemFontPath();
    // Opens the registry keys that list fonts, walks the faces of the system, and records none.
    static void PopulateDatabaseFromRegistry();
    // The file of a face by the registry, while it is open; ".fot" becomes ".ttf". May be empty.
    static CStdStrW GetFileNameFromFaceName(CStdStrW const& face);
    // Always empty.
    static CStdStrW GetFaceNameFromFontName(CStdStrW const& name, bool bold, bool italic);
    static void RemoveAllFileToFontMapEntries();
    static void RemoveAllFontToFileMapEntries();

    static FileToFontMap m_mapFileToFont;
    static FontToFileMap m_mapFontToFile;
    static TzString m_sSystemFontPath;
    static TzString m_sRegistryLocation;
    // Display names of the kinds of fonts.
    static TzString m_sTechnologyTrueType;
    static TzString m_sTechnologyDevice;
    static TzString m_sTechnologyRaster;
    static TzString m_sTechnologyVector;
    static DatabaseStatus m_eDatabaseStatus;
    static std::mutex m_mutexLoading;
};

// The callback of the walk over the system's faces: records nothing and lets it go on.
TZ_API int CTzadFontMapDatabase_EnumFontCallback(tagENUMLOGFONTW* face,
                                                 tagNEWTEXTMETRICW* metrics,
                                                 int kind,
                                                 long long userData);
