#pragma once

#include "module/markup/shared/font_name.h"
#include "module/markup/shared/rtf_color_table.h"
#include "tz/mte/stack_alignment.h"
#include "tz/text/charset.h"
#include "tz/text/string.h"

// The typeface of the text style: the one font for which a set of 0 and the system's set count as
// the same both ways. Written when a conversion begins; shared by all of them.
extern TzString g_sStyleFontName;

// One complete description of how a run of text looks. A plain value.
class CFontAttributes {
public:
    FontName m_sFontName;  // a typeface, never a file
    Charset m_nCharset = kAnsiCharset;
    int m_nPitchAndFamily = 0;  // low four bits pitch, high four family
    bool m_bBold = false;
    bool m_bItalic = false;
    bool m_bUnderline = false;
    bool m_bStrikethrough = false;  // the overline of the markup
    int m_nColorIndex = kByLayerIndex;
    unsigned int m_nRGB = 0xFFFFFF;
    double m_dSize = 0.0;  // text height in drawing units
    VerticalAlignment m_eBaseAlignment = kAlignBottom;

    // Not symmetric. A charset of 0 in the other look and the system's in this one count as the
    // same. The other way round they do so only for the style's own font.
    [[nodiscard]] bool IsSameTypeface(CFontAttributes const& other) const;
    // Leaves out the true colour and the alignment, which open no brace of their own.
    [[nodiscard]] bool operator==(CFontAttributes const& other) const;
};
