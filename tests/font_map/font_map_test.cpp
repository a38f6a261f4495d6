#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <memory>
#include <string>

#include "host/fonts/font_map_path.h"
#include "host/platform/output.h"
#include "module/texts/string_table.h"
#include "tz/mte/font_map_database.h"
#include "tz/mte/globals.h"

namespace {

using Fonts = CMTextFontMapDatabase;

std::filesystem::path scratch() {
    char const* const folder = std::getenv("TZ_TEST_SCRATCH");
    return folder ? folder : std::filesystem::temp_directory_path();
}

// What a look-up by file gives, as one text: face|bold|italic|charset|pitch|type.
std::wstring byFile(Fonts& fonts, wchar_t const* file) {
    Fonts::MapType type = Fonts::MapTypeAll;
    bool bold = true;
    bool italic = true;
    Charset charset = kAnsiCharset;
    int pitch = 0;
    CStdStrW const face = fonts.MapFileToFont(type, file, bold, italic, charset, pitch);
    CStdStrW text;
    text.Fmt(L"%s|%d|%d|%d|%d|%d", face.c_str(), bold, italic, charset, pitch, type);
    return text;
}

// What a look-up by a plain face gives: file|type.
std::wstring
byFace(Fonts& fonts, wchar_t const* face, int charset = 0, int pitch = 0, bool bold = false) {
    Fonts::MapType type = Fonts::MapTypeAll;
    CStdStrW const file =
        fonts.MapFontToFile(type, face, bold, false, static_cast<Charset>(charset), pitch);
    CStdStrW text;
    text.Fmt(L"%s|%d", file.c_str(), type);
    return text;
}

constexpr char kMap[] = R"(; a comment
[SHX Map]
Romans.SHX=Roman S,0,0,0,2
C:\fonts\deep.shx=Deep Face,1,0,0,34
multi.shx=Many Sets,0,0,0,2,128,238
twice.shx=First,0,0,0,0
twice.shx=Second,0,0,0,0
empty.shx=
odd.shx= Spaced ,x,7up,-3,
pair.shx,big.shx=Pair Face,0,1,128,2
misc.shx=Shx Says,0,0,0,0

[Postscript Map]
OneWaySubstitution=1
oneway.pfb=One Way,0,0,0,0
other.pfb=Roman S,0,0,0,2

[Misc Map]
OneWaySubstitution=256
misc.shx=Misc Says,0,0,0,0

[Proxy Fonts]
Proxy 1=Proxy A
Proxy 2=Proxy B
Proxy 4=Never Read
Default=Last Resort
Default Bigfont Proxy=Big Proxy
)";

class FontMap : public testing::Test {
protected:
    FontMap() : before_(tzhost::setFontMapFile(file().string())) {
        write(kMap);
        Fonts(0).ResetContents();
    }
    ~FontMap() override {
        Fonts(0).ResetContents();
        tzhost::setFontMapFile(before_);
    }
    static std::filesystem::path file() { return scratch() / "fonts.ini"; }
    static void write(std::string const& text) { std::ofstream(file()) << text; }

private:
    std::string before_;
};

struct FileCase {
    char const* name;
    wchar_t const* file;
    wchar_t const* found;
};
constexpr FileCase kFiles[] = {
    {"AnyCase", L"ROMANS.shx", L"Roman S|0|0|0|2|1"},
    {"WithoutExtension", L"romans", L"Roman S|0|0|0|2|1"},
    {"FolderInBackslashes", L"D:\\A\\B\\ROMANS", L"Roman S|0|0|0|2|1"},
    {"FolderInTheMap", L"deep.shx", L"Deep Face|1|0|0|34|1"},
    {"LastCharsetOfTheLine", L"multi.shx", L"Many Sets|0|0|238|2|1"},
    {"LaterLineWins", L"twice.shx", L"Second|0|0|0|0|1"},
    {"LaterSectionWins", L"misc.shx", L"Misc Says|0|0|0|0|4"},
    {"NoValue", L"empty.shx", L"|0|0|0|0|1"},
    {"MissingAndOddFieldsReadAsNumbers", L"odd.shx", L"Spaced |0|1|-3|0|1"},
    {"Pair", L"x\\PAIR.shx,y\\big.shx", L"Pair Face|0|1|128|2|1"},
    {"PairWithoutExtensionBehind", L"pair.shx,big", L"Pair Face|0|1|128|2|1"},
    {"UnknownPair", L"a.shx,b.shx", L"Big Proxy|0|0|0|0|2"},
    {"PairThatEndsInTheComma", L"a.shx,", L"Big Proxy|0|0|0|0|2"},
    {"FolderInSlashesIsKept", L"fonts/romans.shx", L"Proxy A|0|0|0|0|2"},
    {"SystemFont", L"DejaVuSans-Bold.ttf", L"DejaVu Sans|1|0|0|34|0"},
    {"MarkIsNoFile", L"OneWaySubstitution", L"Proxy A|0|0|0|0|2"},
    {"Unknown", L"unknown.shx", L"Proxy A|0|0|0|0|2"},
    {"Empty", L"", L"Proxy A|0|0|0|0|2"},
};
class FontFiles : public FontMap, public testing::WithParamInterface<FileCase> {};
TEST_P(FontFiles, MapToFaces) {
    Fonts fonts(0);
    EXPECT_EQ(byFile(fonts, GetParam().file), GetParam().found);
    EXPECT_EQ(byFile(fonts, GetParam().file), GetParam().found);  // a proxy stays with its file
}
INSTANTIATE_TEST_SUITE_P(Names, FontFiles, testing::ValuesIn(kFiles), [](auto const& row) {
    return row.param.name;
});

TEST_F(FontMap, FacesMapBackByTheWholeDescription) {
    Fonts fonts(0);
    EXPECT_EQ(byFace(fonts, L"ROMAN S", 0, 2), L"romans.shx|1");
    EXPECT_EQ(byFile(fonts, L"other.pfb"), L"Roman S|0|0|0|2|3");  // one way: takes no face over
    EXPECT_EQ(byFace(fonts, L"Roman S", 0, 2), L"romans.shx|1");
    EXPECT_EQ(byFace(fonts, L"Roman S", 0, 3), L"|0");  // another pitch
    EXPECT_EQ(byFace(fonts, L"Roman S", 1, 2), L"|0");  // another charset
    EXPECT_EQ(byFace(fonts, L"Many Sets", 0, 2), L"multi.shx|1");
    EXPECT_EQ(byFace(fonts, L"Many Sets", 128, 2), L"multi.shx|1");
    EXPECT_EQ(byFace(fonts, L"One Way"), L"|0");            // a one-way section
    EXPECT_EQ(byFace(fonts, L"Misc Says"), L"misc.shx|4");  // 256 is no one-way mark
    EXPECT_EQ(byFace(fonts, L"Shx Says"),
              L"misc.shx|1");  // an earlier face still leads to the file
    EXPECT_EQ(byFace(fonts, L"DejaVu Sans", 77, 5, true), L"DejaVuSans-Bold.ttf|0");
}

TEST_F(FontMap, FacesOfAnyLengthAndScriptMapBack) {
    Fonts fonts(0);
    std::wstring const longFaces[] = {std::wstring(79, L'F'), std::wstring(80, L'F'),
                                      std::wstring(500, L'F'), L"\u00C4\u0416 Face"};
    for (std::wstring const& face : longFaces) {
        fonts.AddFontSubstitute(face + L".shx", face, true, false, kAnsiCharset, -7,
                                Fonts::MapTypeShx, 0);
        CStdStrW lower(face);
        lower.MakeLower();
        EXPECT_EQ(byFace(fonts, lower.c_str(), 0, -7, true), lower + L".shx|1");
        EXPECT_EQ(BuildFontDescription(face, true, false, kAnsiCharset, -7),
                  lower + L"|b1|i0|c0|p-7");
    }
}

TEST_F(FontMap, TheExtensionOfStrokeFontsIsLowered) {
    gsExtensionSHX = L".SHX";
    Fonts fonts(0);
    EXPECT_EQ(gsExtensionSHX, L".shx");
    EXPECT_EQ(byFile(fonts, L"romans"), L"Roman S|0|0|0|2|1");
}

TEST_F(FontMap, ProxiesRunOutAndTheEmergencyFaceHasNoWayBack) {
    Fonts fonts(0);
    EXPECT_FALSE(fonts.ProxiesAssigned());
    EXPECT_EQ(byFile(fonts, L"u1.shx"), L"Proxy A|0|0|0|0|2");
    EXPECT_EQ(byFile(fonts, L"U2"), L"Proxy B|0|0|0|0|2");
    EXPECT_FALSE(fonts.ProxiesExhausted());
    // The gap at 3 ends the list; the next file reads the key after it.
    EXPECT_EQ(byFile(fonts, L"u3.shx"), L"Last Resort|0|0|0|0|2");
    EXPECT_TRUE(fonts.ProxiesExhausted());
    EXPECT_EQ(byFile(fonts, L"u4.shx"), L"Never Read|0|0|0|0|2");
    EXPECT_EQ(byFace(fonts, L"proxy a"), L"u1.shx|2");
    EXPECT_EQ(byFace(fonts, L"Proxy B"), L"u2|2");
    EXPECT_EQ(byFace(fonts, L"Last Resort"), L"|0");
    EXPECT_TRUE(fonts.ProxiesAssigned());
}

TEST_F(FontMap, PairsShareOneFaceThatLeadsToTheLast) {
    Fonts fonts(0);
    fonts.SetBigfont(L"A.SHX", L"b");
    EXPECT_EQ(byFace(fonts, L"Big Proxy"), L"a.shx,b.shx|2");
    fonts.SetBigfont(L"c,d.shx");
    fonts.SetBigfont(L"no pair");
    EXPECT_EQ(byFace(fonts, L"Big Proxy"), L"c.shx,d.shx|2");
    EXPECT_EQ(byFile(fonts, L"a.shx,b.shx"), L"Big Proxy|0|0|0|0|2");
    EXPECT_EQ(fonts.AddBigfontProxy(L"e,", 0), L"Big Proxy");
    EXPECT_EQ(byFace(fonts, L"big proxy"), L"e.shx,.shx|2");
    EXPECT_TRUE(fonts.IsBigfontProxyFont(L"BIG proxy"));
    EXPECT_TRUE(Fonts::IsBigfontFilespec(L"a,"));
    EXPECT_FALSE(Fonts::IsBigfontFilespec(L"a"));
}

TEST_F(FontMap, TheEndOfOneDatabaseTakesTheProxiesOfAll) {
    Fonts first(0);
    EXPECT_EQ(byFile(first, L"u1.shx"), L"Proxy A|0|0|0|0|2");
    {
        Fonts second(0);
        EXPECT_EQ(byFile(second, L"u2.shx"), L"Proxy A|0|0|0|0|2");  // counts of its own
        EXPECT_EQ(byFace(second, L"Proxy A"), L"u2.shx|2");
    }
    EXPECT_EQ(byFace(first, L"Proxy A"), L"|0");
    EXPECT_EQ(byFile(first, L"romans.shx"), L"Roman S|0|0|0|2|1");  // lines of the file stay
    EXPECT_EQ(byFile(first, L"u1.shx"), L"Proxy B|0|0|0|0|2");
}

TEST_F(FontMap, AFileThatAppearsLaterIsReadAtTheNextLookUp) {
    std::filesystem::remove(file());
    {
        Fonts fonts(0);
        EXPECT_EQ(byFile(fonts, L"romans.shx"), L"txt|0|0|0|0|2");  // no proxies either
        EXPECT_EQ(fonts.GetEmergencyProxy(), L"txt");
        EXPECT_TRUE(fonts.IsBigfontProxyFont(L"system"));
        write(kMap);
        EXPECT_EQ(byFile(fonts, L"romans.shx"), L"Roman S|0|0|0|2|1");
        EXPECT_TRUE(fonts.IsBigfontProxyFont(L"system"));  // read once, by the constructor
    }
    EXPECT_TRUE(Fonts(0).IsBigfontProxyFont(L"Big Proxy"));
}

// A pair that was lent a face fills the tables, so that nothing is read while it is in them.
TEST_F(FontMap, AFileThatAppearsBehindAPairWaitsForItsEnd) {
    std::filesystem::remove(file());
    {
        Fonts fonts(0);
        EXPECT_EQ(byFile(fonts, L"a,b"), L"System|0|0|0|0|2");
        write(kMap);
        EXPECT_EQ(byFile(fonts, L"romans.shx"), L"Proxy A|0|0|0|0|2");
        EXPECT_EQ(byFace(fonts, L"Roman S", 0, 2), L"|0");
    }
    Fonts fonts(0);
    EXPECT_EQ(byFace(fonts, L"Roman S", 0, 2), L"romans.shx|1");
    EXPECT_EQ(byFile(fonts, L"romans.shx"), L"Roman S|0|0|0|2|1");
}

// The mark of a section counts in upper and lower case. Spelled in another case than usual it is
// also read as a line of the map.
TEST_F(FontMap, AMarkInAnotherCaseIsALineAsWell) {
    write("[SHX Map]\noneWAYsubstitution=1\na.shx=A,0,0,0,0\n");
    Fonts fonts(0);
    EXPECT_EQ(byFace(fonts, L"A"), L"|0");
    EXPECT_EQ(byFile(fonts, L"a"), L"A|0|0|0|0|1");
    EXPECT_EQ(byFile(fonts, L"onewaysubstitution"), L"1|0|0|0|0|1");
    EXPECT_EQ(byFace(fonts, L"A"), L"|0");
}

TEST_F(FontMap, RemovesByKind) {
    Fonts fonts(0);
    (void)byFile(fonts, L"u1.shx");
    std::size_t const all = Fonts::m_mapFileToFont.size();
    fonts.RemoveFileToFontMapEntries(Fonts::MapTypeMisc);
    EXPECT_EQ(Fonts::m_mapFileToFont.size(), all - 1);
    fonts.RemoveFileToFontMapEntries(Fonts::MapTypePostscript);
    EXPECT_EQ(Fonts::m_mapFileToFont.size(), all - 3);
    fonts.RemoveFileToFontMapEntries(Fonts::MapTypeSystem);
    EXPECT_TRUE(Fonts::m_mapFileToFont.empty());
    fonts.RemoveFontToFileMapEntries(Fonts::MapTypeAll);
    EXPECT_TRUE(Fonts::m_mapFontToFile.empty());
}

TEST_F(FontMap, OffersFacesToAList) {
    struct List : CMTextFontList {
        std::wstring text;
        void AddShxFont(CStdStrW const& face) override { text += L"shx " + face + L"\n"; }
        void AddSystemFont(CStdStrW const& face) override { text += L"system " + face + L"\n"; }
        void AddMiscFont(CStdStrW const& face) override { text += L"misc " + face + L"\n"; }
        void AddAssignedProxy(CStdStrW const& face, CStdStrW file) override {
            text += L"proxy " + face + L" for " + file + L"\n";
        }
        void AddFreeProxy(CStdStrW const& face) override { text += L"free " + face + L"\n"; }
    };
    write("[SHX Map]\nb.shx=B,0,0,0,0\na.shx=A,0,0,0,0\n[Postscript Map]\np.pfb=P,0,0,0,0\n"
          "[Misc Map]\n"
          "m.ttf=M,0,0,0,0\n[Proxy Fonts]\nProxy 1=P1\nProxy 2=P2\nProxy 3=P3\n");
    Fonts fonts(0);
    (void)byFile(fonts, L"n.shx");
    List list;
    fonts.FixupFontBox(&list);
    EXPECT_EQ(list.text, L"shx A\nshx B\nmisc M\nproxy P1 for n.shx\nfree P2\nfree P3\n");
    // A file that found no free proxy counts too, so no proxy is offered after the end of the list.
    for (wchar_t const* file : {L"o.shx", L"p.shx", L"q.shx"})
        (void)byFile(fonts, file);
    EXPECT_TRUE(fonts.ProxiesExhausted());
    list.text.clear();
    fonts.FixupFontBox(&list);
    EXPECT_EQ(list.text, L"shx A\nshx B\nmisc M\nproxy P1 for n.shx\nproxy P2 for o.shx\n"
                         L"proxy P3 for p.shx\n");
}

TEST_F(FontMap, TheModulesUnloadForgetsTheFile) {
    EXPECT_EQ(FontDatabaseLoader(nullptr), 0);
    EXPECT_EQ(Fonts::m_eDatabaseStatus, Fonts::kLoaded);
    Fonts fonts(0);
    EXPECT_EQ(byFile(fonts, L"romans"), L"Roman S|0|0|0|2|1");
    write("[SHX Map]\nromans.shx=Another,0,0,0,2\n");
    LoadFontDatabase();
    EXPECT_EQ(byFile(fonts, L"romans"), L"Roman S|0|0|0|2|1");
    UnloadFontDatabase();
    EXPECT_EQ(Fonts::m_eDatabaseStatus, Fonts::kNotLoaded);
    EXPECT_EQ(byFile(fonts, L"romans"), L"Another|0|0|0|2|1");
}

TEST_F(FontMap, StatusFollowsLoadAndReset) {
    EXPECT_EQ(Fonts::m_eDatabaseStatus, Fonts::kNotLoaded);
    Fonts fonts(1);
    EXPECT_TRUE(fonts.IsDatabaseLoaded());
    fonts.ResetContents();
    EXPECT_FALSE(fonts.IsDatabaseLoaded());
    // While another place is loading, the user is told of the wait and the status stays.
    struct Prints : tzhost::PrintSink {
        void print(std::wstring_view text) override { printed += text; }
        std::wstring printed;
    } prints;
    auto* const before = tzhost::setPrintSink(&prints);
    Fonts::m_eDatabaseStatus = Fonts::kLoading;
    fonts.LoadContents(0);
    tzhost::setPrintSink(before);
    EXPECT_EQ(Fonts::m_eDatabaseStatus, Fonts::kLoading);
    EXPECT_EQ(prints.printed, gStringTable[169].str() + gStringTable[170].str());
    EXPECT_NE(prints.printed, L"");
}

}  // namespace
