// The font service over the fonts that the tests see.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "host/settings/variables.h"
#include "tz/pal/font_enumeration.h"
#include "tz/text/font_info.h"

namespace {

struct FaceRow {
    char const* name;
    wchar_t const* face;
    bool bold;
    bool italic;
    wchar_t const* file;
};
constexpr FaceRow kFaces[] = {
    {"Regular", L"Liberation Sans", false, false, L"LiberationSans-Regular.ttf"},
    {"Bold", L"Liberation Sans", true, false, L"LiberationSans-Bold.ttf"},
    {"BoldItalic", L"LIBERATION SANS", true, true, L"LiberationSans-BoldItalic.ttf"},
    {"OnlyBold", L"DejaVu Sans", true, false, L"DejaVuSans-Bold.ttf"},
    {"NoItalic", L"DejaVu Sans", true, true, L"DejaVuSans-Bold.ttf"},
    {"NoBold", L"DejaVu Serif", true, false, L"DejaVuSerif.ttf"},
    {"Unknown", L"Arial", false, false, L""},  // a stand-in would be Liberation Sans
    {"Generic", L"sans-serif", false, false, L""},
    {"Part", L"DejaVu", false, false, L""},
    {"Empty", L"", false, false, L""},
};
class Faces : public testing::TestWithParam<FaceRow> {};
TEST_P(Faces, HaveTheirFiles) {
    CStdStrW file = L"before";
    bool const known =
        tzFontInfo().FontNameToFile(GetParam().face, GetParam().bold, GetParam().italic, file);
    EXPECT_EQ(file, GetParam().file);
    EXPECT_EQ(known, !file.empty());
}
INSTANTIATE_TEST_SUITE_P(Catalogue, Faces, testing::ValuesIn(kFaces), [](auto const& row) {
    return row.param.name;
});

struct FileRow {
    char const* name;
    wchar_t const* file;
    wchar_t const* face;  // empty: unknown
    bool bold;
    bool italic;
    int charset;
    int pitchAndFamily;
};
constexpr FileRow kFiles[] = {
    {"Sans", L"DejaVuSans.ttf", L"DejaVu Sans", false, false, 0, 0x22},
    {"InAFolder", L"c:\\fonts\\DEJAVUSANS-BOLD.TTF", L"DejaVu Sans", true, false, 0, 0x22},
    {"Mono", L"/usr/fonts/DejaVuSansMono.ttf", L"DejaVu Sans Mono", false, false, 0, 0x31},
    {"Serif", L"DejaVuSerif.ttf", L"DejaVu Serif", false, false, 0, 0x12},
    {"Italic", L"LiberationSans-Italic.ttf", L"Liberation Sans", false, true, 0, 0x22},
    {"Hebrew", L"NotoSansHebrew-Regular.ttf", L"Noto Sans Hebrew", false, false, 177, 0x22},
    {"Arabic", L"NotoSansArabic-Regular.ttf", L"Noto Sans Arabic", false, false, 178, 0x22},
    {"Thai", L"NotoSansThai-Regular.ttf", L"Noto Sans Thai", false, false, 222, 0x22},
    {"Armenian", L"NotoSansArmenian-Regular.ttf", L"Noto Sans Armenian", false, false, 1, 0x22},
    {"EastAsian", L"DroidSansFallbackFull.ttf", L"Droid Sans Fallback", false, false, 128, 0x22},
    {"StrokeFont", L"txt.shx", L"", false, false, 0, 0},
    {"Unknown", L"arial.ttf", L"", false, false, 0, 0},
    {"Empty", L"", L"", false, false, 0, 0},
};
class Files : public testing::TestWithParam<FileRow> {};
TEST_P(Files, HaveTheirFaces) {
    FileRow const& row = GetParam();
    CStdStrW face = L"before";
    bool bold = true;
    bool italic = true;
    Charset charset = kOemCharset;
    FontPitch pitch = FontPitch::kFixed;
    FontFamily family = FontFamily::kScript;
    bool const known =
        tzFontInfo().FileToFontName(row.file, face, bold, italic, charset, pitch, family);
    EXPECT_EQ(face, row.face);
    EXPECT_EQ(known, !face.empty());
    EXPECT_EQ(bold, row.bold);
    EXPECT_EQ(italic, row.italic);
    EXPECT_EQ(charset, row.charset);
    EXPECT_EQ(getPitchAndFamilyValueFromEnum(pitch, family), row.pitchAndFamily);
}
INSTANTIATE_TEST_SUITE_P(Catalogue, Files, testing::ValuesIn(kFiles), [](auto const& row) {
    return row.param.name;
});

TEST(FontInfo, TellsOfAFaceByItsExactName) {
    CFontInfoItem item;
    EXPECT_TRUE(tzFontInfo().FontInfoFromTypeFaceName(L"liberation sans", item));
    EXPECT_EQ(item.faceName, L"Liberation Sans");
    EXPECT_TRUE(item.hasBold && item.hasItalic);
    EXPECT_FALSE(tzFontInfo().FontInfoFromTypeFaceName(L"Helvetica", item));
    EXPECT_EQ(item.faceName, L"");
    EXPECT_FALSE(item.hasBold);
    EXPECT_EQ(tzFontInfo().TypefaceNativeToEnglish(L"dejavu sans"), L"dejavu sans");
    EXPECT_EQ(tzFontInfo().TypefaceEnglishToNative(L"Nothing"), L"Nothing");
}

TEST(FontInfo, FollowsTheSystemPage) {
    auto& store = tzhost::Variables::instance();
    CFontInfoItem item;
    auto const charsetIn = [&](wchar_t const* page, wchar_t const* face) {
        EXPECT_TRUE(store.set(L"SYSCODEPAGE", std::wstring(page), tzhost::Writer::host).isDone());
        EXPECT_TRUE(tzFontInfo().FontInfoFromTypeFaceName(face, item));
        return int{item.charset};
    };
    EXPECT_EQ(charsetIn(L"ANSI_1251", L"DejaVu Sans"), 0);
    EXPECT_EQ(charsetIn(L"ANSI_932", L"DejaVu Sans"), 204);
    EXPECT_EQ(charsetIn(L"ANSI_1252", L"DejaVu Sans"), 0);
}

// Gathers what an enumeration reports; ends it after "stop" reports.
struct Gathered {
    std::vector<std::wstring> names;
    std::size_t stop = 1000;
    static int
    callback(tagENUMLOGFONTW* face, tagNEWTEXTMETRICW* metrics, int kind, long long userData) {
        Gathered& self = *reinterpret_cast<Gathered*>(userData);
        EXPECT_EQ(kind, 4);
        EXPECT_EQ(metrics->tmWeight, face->elfLogFont.lfWeight);
        self.names.emplace_back(face->elfFullName);
        return self.names.size() < self.stop ? 1 : 0;
    }
    int run(wchar_t const* family) {
        HDC const device = GetDC(GetDesktopWindow());
        int const result =
            EnumFontFamilies(device, family, &callback, reinterpret_cast<long long>(this));
        ReleaseDC(GetDesktopWindow(), device);
        return result;
    }
};

TEST(FontEnumeration, ReportsFamiliesOnceAndTheirForms) {
    Gathered all;
    EXPECT_EQ(all.run(nullptr), 1);
    ASSERT_GE(all.names.size(), 3U);
    EXPECT_EQ(all.names[0], L"DejaVu Sans Regular");
    EXPECT_EQ(all.names[1], L"DejaVu Sans Mono Regular");
    Gathered two{{}, 2};
    EXPECT_EQ(two.run(nullptr), 0);
    EXPECT_EQ(two.names.size(), 2U);
    Gathered forms;
    EXPECT_EQ(forms.run(L"Liberation Sans"), 1);
    EXPECT_EQ(forms.names.size(), 4U);
    Gathered none;
    EXPECT_EQ(none.run(L"Arial"), 1);
    EXPECT_TRUE(none.names.empty());
}

}  // namespace
