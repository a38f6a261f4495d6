#pragma once

#include "tz/export.h"
#include "tz/pal/font_enumeration.h"
#include "tz/text/std_str.h"

// What the two process-wide font tables hold. The tables own their entries and delete them.
class TZ_API IFileToFontMapEntry {
public:
    virtual ~IFileToFontMapEntry();
};

class TZ_API IFontToFileMapEntry {
public:
    virtual ~IFontToFileMapEntry();
};

// The richer entries that the catalogue's own read operations need. The module makes none; who
// fills the tables for those operations fills them with these alone.
class TZ_API CTzadFileToFontMapEntry : public IFileToFontMapEntry {
public:
    bool m_bBold = false;
    bool m_bItalic = false;
    LOGFONTW m_logFont{};
};

// The files of a face's four forms; an empty one has to be synthesised.
class TZ_API CTzadFontToFileMapEntry : public IFontToFileMapEntry {
public:
    CStdStrW m_sRegular;
    CStdStrW m_sBold;
    CStdStrW m_sItalic;
    CStdStrW m_sBoldItalic;
};
