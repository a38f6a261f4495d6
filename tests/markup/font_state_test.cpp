// The codes between looks, and which typefaces count as the same.

#include <gtest/gtest.h>

#include "host/settings/variables.h"
#include "module/markup/write_markup/font_state.h"
#include "tests/markup/conversions.h"
#include "tz/gi/color.h"

namespace {

// The system's page, and with it the system's set, for the life of the object.
class SystemPage {
public:
    explicit SystemPage(wchar_t const* page) {
        (void)tzhost::Variables::instance().overrideFromText(L"SYSCODEPAGE", page);
    }
    ~SystemPage() {
        (void)tzhost::Variables::instance().overrideFromText(L"SYSCODEPAGE", L"ANSI_1252");
    }
    SystemPage(SystemPage const&) = delete;
    SystemPage& operator=(SystemPage const&) = delete;
};

class FontState : public testing::Test {
protected:
    FontState() {
        state.InitializeFontName(L"Base", false, false, kAnsiCharset, 34);
        state.InitializeFontSize(2.5);
        state.InitializeColor(256, 0xFFFFFF);
    }
    std::wstring emitted() {
        std::wstring const codes = state.EmitStateInMText();
        state.Reset();
        return codes;
    }
    markuptest::OwnFontMap map;
    CMTextFontMapDatabase fonts{0};
    CFontState state{&fonts};
};

TEST_F(FontState, OpensOneBraceAndReturnsWithOne) {
    EXPECT_FALSE(state.IsEmissionPending());
    state.SetUnderline(false);
    EXPECT_TRUE(state.IsEmissionPending());
    EXPECT_EQ(emitted(), L"");
    EXPECT_FALSE(state.IsEmissionPending());
    state.SetFontSize(3.0);
    EXPECT_EQ(emitted(), L"{\\H1.2x;");
    state.SetUnderline(true);
    EXPECT_EQ(emitted(), L"\\L");
    state.SetUnderline(false);
    state.SetFontSize(2.5);
    EXPECT_EQ(emitted(), L"}");
    EXPECT_EQ(state.EmitTerminatingStateInMText(), L"");
    state.SetStrikethrough(true);
    EXPECT_EQ(emitted(), L"{\\O");
    EXPECT_EQ(state.EmitTerminatingStateInMText(), L"}");
    EXPECT_EQ(state.EmitTerminatingStateInMText(), L"");
}

TEST_F(FontState, WritesATrueColorWithoutABrace) {
    state.SetColor(256, 0x123456);
    EXPECT_EQ(emitted(), L"\\C256;");
    state.SetColor(1, tzedGetRGB(1));
    EXPECT_EQ(emitted(), L"{\\C1;");
    state.SetColor(1, 0x0000FE);
    EXPECT_EQ(emitted(), L"\\C1;\\c254;");
    state.SetColor(0, 0x0000FE);
    EXPECT_EQ(emitted(), L"\\C0;");
}

TEST_F(FontState, WritesNoSizeBehindAnUnknownOne) {
    CFontState unset(&fonts);
    unset.SetFontSize(3.0);
    EXPECT_STREQ(unset.EmitStateInMText().c_str(), L"{");
}

TEST_F(FontState, NamesFacesAndFiles) {
    state.SetFontName(L"Plotter");
    state.SetPitchAndFamily(49);
    EXPECT_EQ(emitted(), L"{\\Ftxt.shx|c0;");
    state.SetCharSet(kDefaultCharset);
    EXPECT_EQ(emitted(), L"\\fPlotter|b0|i0|c0|p49;");  // no file has that set
    state.SetFontName(L"PAIRED");
    EXPECT_EQ(emitted(), L"\\F|c1;");  // no pair is lent yet; the file form keeps the set 1
    fonts.AddFontSubstitute(L"folder\\", L"Nameless", false, false, kAnsiCharset, 49,
                            CMTextFontMapDatabase::MapTypeMisc, 0);
    state.SetFontName(L"Nameless");
    state.SetCharSet(kAnsiCharset);
    EXPECT_EQ(emitted(), L"\\fNameless|b0|i0|c0|p49;");  // mapped, but to no file
    SystemPage const chinese(L"ANSI_936");
    state.SetFontName(L"Other");
    state.SetCharSet(kDefaultCharset);
    EXPECT_EQ(emitted(), L"\\fOther|b0|i0|c134|p49;");
}

// The first two steps count as the style's own font, the third counts as that font alone.
TEST_F(FontState, ClosesNoBraceThatIsNotOpen) {
    SystemPage const chinese(L"ANSI_936");
    state.InitializeFontName(L"Base", false, false, kGb2312Charset, 34);
    state.SetFontName(L"BASE");
    state.SetCharSet(kAnsiCharset);
    EXPECT_EQ(emitted(), L"");
    state.SetCharSet(kGb2312Charset);
    EXPECT_EQ(emitted(), L"");
    state.SetCharSet(kAnsiCharset);
    EXPECT_EQ(emitted(), L"{\\fBASE|b0|i0|c0|p34;");  // was "}", and then a length error
    EXPECT_EQ(state.EmitTerminatingStateInMText(), L"}");
}

TEST_F(FontState, GivesALookBack) {
    {
        CFontState saved(&state);
        state.SetUnderline(true);
        EXPECT_EQ(emitted(), L"{\\L");
    }
    EXPECT_TRUE(state.IsEmissionPending());
    EXPECT_EQ(emitted(), L"}");
    CFontState other(&fonts);
    other.SetValuesFrom(&state);
    EXPECT_TRUE(other.IsEmissionPending());
    other.SetBaseAlignment(kAlignTop, 1);
    EXPECT_EQ(other.GetBaseAlignment(0), kAlignTop);
    EXPECT_EQ(other.GetBaseAlignment(1), kAlignBottom);
}

// The second code for the face used to be a copy of the first.
TEST_F(FontState, WritesAFaceByTheTablesOfTheMoment) {
    FontName const lent(L"Lent One");
    state.SetPitchAndFamily(0);
    state.SetFontName(lent);
    EXPECT_EQ(emitted(), L"{\\fLent One|b0|i0|c0|p0;");
    state.SetFontName(L"Other");
    EXPECT_EQ(emitted(), L"\\fOther|b0|i0|c0|p0;");
    fonts.AddProxy(L"none.shx");
    state.SetFontName(lent);
    EXPECT_EQ(emitted(), L"\\Fnone.shx|c0;");
}

TEST_F(FontState, TellsTypefacesApart) {
    SystemPage const chinese(L"ANSI_936");
    struct Row {
        char const* name;
        wchar_t const* face;
        int charset;
        wchar_t const* otherFace;
        int otherCharset;
        bool isSame;
    };
    constexpr Row kRows[] = {
        {"Same", L"A", 204, L"A", 204, true},
        {"CaseDoesNotCount", L"a", 204, L"A", 204, true},
        {"OtherName", L"A", 0, L"B", 0, false},
        {"OtherSet", L"A", 204, L"A", 0, false},
        {"SystemAgainstNone", L"A", 134, L"A", 0, true},
        {"NoneAgainstSystem", L"A", 0, L"A", 134, false},
        {"OfTheStyle", L"Base", 0, L"Base", 134, true},
        {"OfTheStyleExactly", L"Base", 0, L"BASE", 134, false},
    };
    for (Row const& row : kRows) {
        CFontAttributes one;
        one.m_sFontName = row.face;
        one.m_nCharset = static_cast<Charset>(row.charset);
        CFontAttributes other;
        other.m_sFontName = row.otherFace;
        other.m_nCharset = static_cast<Charset>(row.otherCharset);
        EXPECT_EQ(one.IsSameTypeface(other), row.isSame) << row.name;
        EXPECT_EQ(one == other, row.isSame) << row.name;
    }
}

TEST(Looks, DifferByAllButTrueColorAndAlignment) {
    struct Row {
        char const* name;
        void (*change)(CFontAttributes&);
        bool isSameTypeface;
        bool isEqual;
    };
    constexpr Row kRows[] = {
        {"Pitch", [](CFontAttributes& look) { look.m_nPitchAndFamily = 1; }, false, false},
        {"Bold", [](CFontAttributes& look) { look.m_bBold = true; }, false, false},
        {"Italic", [](CFontAttributes& look) { look.m_bItalic = true; }, false, false},
        {"Underline", [](CFontAttributes& look) { look.m_bUnderline = true; }, true, false},
        {"Strike", [](CFontAttributes& look) { look.m_bStrikethrough = true; }, true, false},
        {"ColorIndex", [](CFontAttributes& look) { look.m_nColorIndex = 1; }, true, false},
        {"Size", [](CFontAttributes& look) { look.m_dSize = 1e-300; }, true, false},
        {"TrueColor", [](CFontAttributes& look) { look.m_nRGB = 0; }, true, true},
        {"Alignment", [](CFontAttributes& look) { look.m_eBaseAlignment = kAlignTop; }, true, true},
    };
    for (Row const& row : kRows) {
        CFontAttributes look;
        row.change(look);
        EXPECT_EQ(look.IsSameTypeface(CFontAttributes()), row.isSameTypeface) << row.name;
        EXPECT_EQ(look == CFontAttributes(), row.isEqual) << row.name;
    }
}

}  // namespace
