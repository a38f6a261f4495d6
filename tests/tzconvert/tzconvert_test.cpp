// The program as a script meets it: what it prints, writes and refuses.

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

#include <sys/stat.h>
#include <sys/wait.h>

#include <gtest/gtest.h>

#include "apps/tzconvert/font_tables.h"
#include "apps/tzconvert/text_codec.h"
#include "host/fonts/font_map_path.h"
#include "tz/mte/font_map_database.h"

namespace {

namespace fs = std::filesystem;

std::string contentsOf(fs::path const& file) {
    std::ostringstream bytes;
    bytes << std::ifstream(file, std::ios::binary).rdbuf();
    return bytes.str();
}

void write(fs::path const& file, std::string const& bytes) {
    std::ofstream(file, std::ios::binary) << bytes;
}

struct Outcome {
    int status;
    std::string out;
    std::string err;
};

// Runs the program after `first`, which may limit what the program gets or where it runs.
Outcome run(std::string const& arguments, std::string const& input, std::string const& first = "") {
    write("in", input);
    std::string const command = "{ " + first + "'" + std::getenv("TZ_TEST_BIN") + "/tzconvert' " +
                                arguments + "; } <in >out 2>err";
    int const status = std::system(command.c_str());
    return {WEXITSTATUS(status), contentsOf("out"), contentsOf("err")};
}

struct RunCase {
    char const* name;
    char const* arguments;
    std::string_view input;
    int status;
    char const* out;  // all of it, or a part after a "~"
    char const* err;  // a part
};
using std::string_view_literals::operator""sv;
constexpr RunCase kRuns[] = {
    {"ToRtf", "to-rtf", "A{\\H2x;B}"sv, 0, "~A{\\fs64 B}\\par }", ""},
    {"ToMtext", "to-mtext", "{\\rtf1 a\\ul b}"sv, 0, "a{\\Lb}", ""},
    {"NothingAdded", "to-mtext", "a\xC3\xA9\n"sv, 0, "a\xC3\xA9", ""},
    {"NewlineIsInput", "to-rtf", "a\n"sv, 0, "~a\\line \\par }", ""},
    {"RoundTrip", "round-trip", "\\T1.5;{\\Lx}\\P"sv, 0, "\\T1.5;{\\Lx}", ""},
    {"KeepsMarks", "round-trip --keep-trailing-paragraphs", "x"sv, 0, "x\\P", ""},
    {"ShippedFontMap", "round-trip",
     "{\\Fromans|c204;a}{\\Ftxt.shx,extfont.shx|c128;b}{\\Fnone.shx;c}"sv, 0,
     "{\\Fromans.shx|c204;a\\Ftxt.shx,extfont.shx|c128;b\\Fnone.shx|c0;c}", ""},
    {"Values", "to-mtext --tracking 2 --width-factor .5 --oblique 15 --base-alignment 1", "\\\\S"sv,
     0, "\\T2;\\W0.5;\\Q15;\\A1;\\\\S", ""},
    {"Face", "to-rtf --font Some --bold --italic --charset 204 --pitch 18", "x"sv, 0,
     "~{\\f0\\froman\\fprq2\\fcharset204 Some;}", ""},
    {"FaceStyle", "to-rtf --font Some --bold", "x"sv, 0, "~\\fs32\\b \\deftab0 x", ""},
    {"Size", "to-mtext --size 2.5 --twips 280", "\\fs56 x"sv, 0, "{\\H2x;x}", ""},

    // A size that the markup names at the style's own twips comes back as itself.
    {"SizeBesideTheStyles", "round-trip", "\\H0.2001;a"sv, 0, "{\\H1x;a}", ""},
    {"SizeBetweenHalfPoints", "round-trip --twips 325", "abc {\\Ld} e"sv, 0,
     "{\\H0.9846x;abc \\Ld\\l e}", ""},
    {"DeviceAsMap", "to-rtf --font-map /dev/null", "a"sv, 2, "",
     "/dev/null: cannot be read: it is a device"},
    {"EmptyFile", "to-rtf \"\"", "a"sv, 2, "", "an empty name"},
    {"EmptyOutputDir", "to-rtf --output-dir \"\"", "a"sv, 2, "", "an empty name"},
    {"OutputOverItsInput", "to-rtf --output in", "a"sv, 2, "",
     "standard input: its result would take the place of in"},
    // The lead byte is one of the page that decodes it, the system's.
    {"LeadByteOfNoPage", "to-mtext --code-page 936", "\\ansicpg65001 \\'b0\\'a1"sv, 0,
     "\xE5\x95\x8A", ""},
    {"LeadByteOfSymbols", "to-mtext --code-page 936 --font S --charset 2",
     "{\\fonttbl{\\f0\\fcharset2 S;}}\\f0 \\'b0\\'a1"sv, 0, "\xE5\x95\x8A", ""},
    {"SecondTrip", "round-trip", "a {\\H1.4x;\\Le\\H0.7143x;f} g"sv, 0,
     "{\\H1x;a \\H1.4x;\\Le\\H0.7143x;f\\l g}", ""},
    {"Color", "to-rtf --color 112233", "x"sv, 0, "~\\red17\\green34\\blue51;", ""},
    {"ByLayer", "to-mtext --by-layer FF0000 --by-block ff0000",
     "{\\colortbl\\red255\\green0\\blue0;\\red254\\green0\\blue0;}\\cf0 a\\cf1 b"sv, 0,
     "{\\C256;a\\C0;b}", ""},
    {"CodePage", "to-mtext --code-page 1251", "\\'c0"sv, 0, "\xD0\x90", ""},
    {"SystemSet", "to-mtext --code-page 936 --font Base --charset 134",
     "{\\fonttbl{\\f0\\fcharset0 BASE;}{\\f1\\fcharset134 BASE;}}\\f0 a\\f1 b\\f0 c"sv, 0,
     "ab{\\fBASE|b0|i0|c0|p0;c}", ""},
    {"Dash", "to-mtext -", "a"sv, 0, "a", ""},
    {"Empty", "to-mtext", ""sv, 0, "", ""},
    {"NotUtf8", "to-rtf", "ab\xE9x"sv, 2, "", "standard input: byte 2: not UTF-8"},
    {"CutOffUtf8", "round-trip", "ab\xE4\xB8"sv, 2, "", "byte 2: not UTF-8"},
    {"ZeroCharacter", "to-mtext", "a\0b"sv, 2, "", "byte 1: a zero character"},
    {"ControlsInAName", "to-rtf \"$(printf 'a\\033]b')\"", ""sv, 2, "",
     "a\\U+001B]b: cannot be read"},
    {"NoFile", "to-rtf none.txt", ""sv, 2, "", "none.txt: cannot be read"},
    {"FolderAsFile", "to-rtf .", ""sv, 2, "", ".: cannot be read"},
    {"FolderAsMap", "to-rtf --font-map .", "a"sv, 2, "", ".: cannot be read"},
    {"NoSuchPage", "to-rtf --code-page 0", "a"sv, 2, "", "--code-page"},
    {"NoFontMap", "to-rtf --font-map none.ini", "a"sv, 2, "", "none.ini: cannot be read"},
    {"NoFolder", "to-rtf --output none/x.rtf", "a"sv, 2, "", "none/x.rtf: cannot be written"},
    {"NoCommand", "", ""sv, 2, "", "-rtf, to-mtext, round-trip, normalise; try --help"},
    {"OptionAheadOfCommand", "--size 3 to-rtf in", "a"sv, 2, "",
     "options stand after the command, not \"--size\""},
    {"UnknownCommand", "to-html", ""sv, 2, "", "to-mtext, round-trip, normalise, not \"to-html\""},
    {"Version", "--version", ""sv, 0, "~tzconvert 1", ""},
    {"DashAsOutput", "to-mtext --output -", "a"sv, 0, "a", ""},
    {"ReportOnOutput", "to-mtext --output text --report - --size 2.5", "a"sv, 0,
     "~\"incidents\": 0", ""},
    {"ReportOverOutput", "to-mtext --report -", "a"sv, 2, "", "--report"},
    {"ReportOverFile", "to-mtext --output text --report text", "a"sv, 2, "", "--report"},
    {"NoSize", "to-rtf --size 0", "a"sv, 2, "", "0 is no number above 0"},
    {"SizeWithoutEnd", "to-rtf --size inf", "a"sv, 2, "", "inf is no number above 0"},
    {"SizeThatIsNone", "to-rtf --size nan", "a"sv, 2, "", "nan is no number above 0"},
    {"NoTracking", "to-mtext --tracking nan", "a"sv, 2, "", "nan is no number that markup can say"},
    {"WidthWithoutEnd", "to-mtext --width-factor 1e400", "a"sv, 2, "", "1e400 is no number"},
    {"ObliqueInPowers", "to-mtext --oblique -1e6", "a"sv, 2, "", "-1e6 is no number"},
    {"TrackingInPowers", "to-mtext --tracking 0.00001", "a"sv, 2, "", "0.00001 is no number"},
    {"TrackingThatIsNone", "to-mtext --tracking 0.0", "a"sv, 2, "", "0.0 is no tracking"},
    {"SizeOfNoHalfPoint", "to-rtf --twips 9", "a"sv, 2, "", "--twips"},
    {"NegativeTwips", "to-rtf --twips -5", "a"sv, 2, "", "--twips"},
    {"NoCharset", "to-rtf --font Some --charset 999", "a"sv, 2, "", "--charset"},
    {"UnknownPage", "to-rtf --code-page 99", "a"sv, 2, "", "--code-page 99 is not known"},
    {"EmptyName", "to-rtf --output \"\"", "a"sv, 2, "", "an empty name"},
    {"EmptyFace", "to-rtf --font \"\" --bold", "a"sv, 2, "", "an empty name"},
    {"EmptyFontFile", "to-rtf --font-file \"\"", "a"sv, 2, "", "an empty name"},
    {"UnknownOption", "to-rtf --loud", "a"sv, 2, "", "--loud"},
    {"BadColor", "to-rtf --color red", "a"sv, 2, "", "\"red\" is not RRGGBB"},
    {"BadNumber", "to-rtf --twips many", "a"sv, 2, "", "--twips"},
    {"BadAlignment", "to-mtext --base-alignment 3", "a"sv, 2, "", "--base-alignment"},
    {"BoldNeedsFace", "to-rtf --bold", "a"sv, 2, "", "--font"},
    {"NoOutputDir", "to-rtf --output-dir nosuch/x in in", "a"sv, 2, "", "exist: nosuch/x"},
    {"TwoFiles", "to-rtf in in", "a"sv, 2, "", "--output-dir"},
    {"OutputClosed", "to-rtf >&-", "a"sv, 2, "", "standard output: Bad file descriptor"},
    {"HeadWithoutText", "to-mtext --werror",
     "{\\rtf1\\ansi\\deflang1033\\viewkind4\\uc1\\deftab0\\pard\\fi8 a}"sv, 0, "~a", ""},
    {"MarkupThatIsLost", "to-rtf", "\\T2;\\T3;\\xa\\Sb;\\y{\\fNo|b0;c}"sv, 0, "~c}\\par }",
     "warning: unknown codes, kept as text: 2\n"
     "tzconvert: standard input: warning: stacks without a sign, kept as text: 1\n"
     "tzconvert: standard input: warning: faces that no file is known of: 1\n"
     "tzconvert: standard input: warning: further \\T codes, lost: 1\n"},
    {"RtfThatIsLost", "to-mtext",
     "{\\rtf1\\kerning0 a{\\new b}{\\info c}{\\*\\x d}\\kerning0 e}}f"sv, 0, "ae",
     "warning: unknown words, passed over: 4, the first \\kerning\n"
     "tzconvert: standard input: warning: texts lost with the unknown word before them, which "
     "--normalise keeps: 1, the first \\new\n"
     "tzconvert: standard input: warning: what stands behind the last \"}\" is lost\n"},
    {"RtfAsMarkup", "to-rtf", " {\\rtf1 a}"sv, 0, "~", "it looks like RTF; to-mtext converts"},
    {"MarkupAsRtf", "to-mtext", "a\\Pb"sv, 0, "aPb", "it looks like markup; to-rtf converts"},
    {"MarkupAsAnyRtf", "normalise", "a\\Pb"sv, 0, "~", "it looks like markup; to-rtf converts"},
    {"WarningAsError", "to-mtext --werror", "{\\rtf1 a\\new b}"sv, 1, "ab", "unknown words"},
    {"Quiet", "to-mtext -q", "{\\rtf1 a\\new b}"sv, 0, "ab", ""},
    {"QuietError", "to-mtext -q --normalise --werror", "a{\\pict}"sv, 1, "a", ""},
    {"NearCommand", "to-rft", ""sv, 2, "", "not \"to-rft\"; did you mean to-rtf?"},
    {"NearOption", "to-rtf --szie=3", ""sv, 2, "", "--szie=3; did you mean --size?"},
    {"HelpOnACommand", "help to-rtf", ""sv, 0, "~Usage: tzconvert to-rtf", ""},
    {"HelpOnHelp", "help --help", ""sv, 0, "~round-trip", ""},
    {"HelpOnNothing", "help toRTF", ""sv, 2, "", "not \"toRTF\"; did you mean to-rtf?"},
    {"ShortVersion", "-v", ""sv, 0, "~tzconvert 1", ""},
    {"UnknownLanguage", "to-rtf --locale x1", ""sv, 2, "",
     "--locale x1: no texts of this language; there are en, de"},
    {"German", "to-rtf --locale de", "\\x"sv, 0, "~", "Warnung: unbekannte Codes"},
    {"RecursionToOutput", "to-rtf -r .", ""sv, 2, "", "--recursive: it needs --output-dir"},
    {"Help", "to-rtf --help", ""sv, 0, "~--output-dir", ""},
    {"HelpOfAll", "--help", ""sv, 0, "~round-trip", ""},
};

class Runs : public testing::TestWithParam<RunCase> {};
TEST_P(Runs, EndAs) {
    RunCase const& row = GetParam();
    Outcome const result = run(row.arguments, std::string(row.input));
    EXPECT_EQ(result.status, row.status) << result.err;
    if (row.out[0] == '~')
        EXPECT_NE(result.out.find(row.out + 1), std::string::npos) << result.out;
    else
        EXPECT_EQ(result.out, row.out);
    EXPECT_NE(result.err.find(row.err), std::string::npos) << result.err;
    EXPECT_EQ(result.err.empty(), row.err[0] == '\0') << result.err;
}
INSTANTIATE_TEST_SUITE_P(Commands, Runs, testing::ValuesIn(kRuns), [](auto const& row) {
    return row.param.name;
});

// Both used to end with 0 and not a word.
TEST(Usage, ThatCannotBeWrittenIsSaid) {
    for (char const* const asked : {"--help", "--version"}) {
        Outcome const result = run(std::string(asked) + " >/dev/full", "");
        EXPECT_EQ(result.status, 2) << asked;
        EXPECT_TRUE(result.err.starts_with("tzconvert: standard output: ")) << result.err;
    }
}

TEST(Normaliser, TakesBytesAndCountsWhatIsLeftOutInOneLine) {
    std::string_view const rtf =
        "{\\new \xC0\0}\\u-10179?\\u-8704?{\\pict}{\\footnote}{\\footnote}{\\header}"sv;
    Outcome const read = run("to-mtext --normalise --code-page 1251", std::string(rtf));
    EXPECT_EQ(read.out, "\\U+0410\xF0\x9F\x98\x80");
    Outcome const written = run("normalise --code-page 1251", std::string(rtf));
    EXPECT_EQ(written.status, 0);
    EXPECT_EQ(written.out, "{\\rtf1\\ansi\n\\pard \\u1040?\xF0\x9F\x98\x80\\par\n}");
    EXPECT_EQ(written.err,
              "tzconvert: standard input: warning: left out: 1 picture, 2 notes, 1 header or "
              "footer\n");
    EXPECT_EQ(read.err, written.err);
}

TEST(Files, AreWrittenWholeOrNotAtAll) {
    write("kept.rtf", "old");
    EXPECT_EQ(run("to-rtf --output kept.rtf", "a\xFF").status, 2);
    EXPECT_EQ(contentsOf("kept.rtf"), "old");
    EXPECT_EQ(run("to-mtext --output kept.rtf", "new").status, 0);
    EXPECT_EQ(contentsOf("kept.rtf"), "new");
    fs::permissions("kept.rtf", fs::perms::owner_read);
    EXPECT_EQ(run("to-mtext --output kept.rtf", "newer").status, 2);
    EXPECT_EQ(contentsOf("kept.rtf"), "new");
    fs::permissions("kept.rtf", fs::perms::owner_all);
}

TEST(Files, OfABatchAreConvertedThoughOneFails) {
    fs::remove_all("batch");
    fs::create_directories("batch");
    write("one.txt", "1");
    write("bad.txt", "\xFF");
    write("two.txt", "{\\L2}");
    Outcome const result = run("to-rtf --output-dir batch --report batch.json "
                               "none/one.txt one.txt bad.txt two.txt one.txt",
                               "");
    EXPECT_EQ(result.status, 2);
    EXPECT_NE(result.err.find("none/one.txt: cannot be read"), std::string::npos) << result.err;
    EXPECT_NE(result.err.find("bad.txt: byte 0"), std::string::npos) << result.err;
    EXPECT_NE(result.err.find("another file's result"), std::string::npos) << result.err;
    EXPECT_NE(contentsOf("batch/one.rtf").find("1\\par }"), std::string::npos);
    EXPECT_NE(contentsOf("batch/two.rtf").find("{\\ul 2}\\par }"), std::string::npos);
    EXPECT_FALSE(fs::exists("batch/bad.rtf"));
    std::string const report = contentsOf("batch.json");
    EXPECT_NE(report.find("\"file\": \"two.txt\""), std::string::npos) << report;
    EXPECT_EQ(report.find("bad.txt"), std::string::npos) << report;
}

// What has no ending of an input, a hidden name, a pipe, a folder behind a link and the results of
// earlier stay out.
TEST(Files, OfFoldersKeepTheirPlaces) {
    fs::remove_all("tree");
    fs::create_directories("tree/below/.hidden");
    fs::create_directories("tree/made/below");
    write("tree/made/below/earlier.rtf", "e");
    ASSERT_EQ(mkfifo("tree/pipe.rtf", 0600), 0);
    fs::create_directory_symlink("..", "tree/loop");
    write("tree/a.rtf", "{\\rtf1 a}");
    write("tree/b.txt", "b");
    write("tree/below/A.RTF", "{\\rtf1\\new A}");
    write("tree/below/.hidden/c.rtf", "c");
    write("tree/below/bad.rtf", "\xFF");
    Outcome const result = run("to-mtext --recursive --output-dir tree/made tree", "");
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(
        result.err,
        "tzconvert: tree/below/A.RTF: warning: unknown words, passed over: 1, the first \\new\n"
        "tzconvert: tree/below/bad.rtf: byte 0: not UTF-8\n"
        "tzconvert: 2 of 3 files converted, 1 failed, 1 with warnings\n");
    EXPECT_EQ(contentsOf("tree/made/a.mtext"), "a");
    EXPECT_EQ(contentsOf("tree/made/below/A.mtext"), "A");
    std::size_t const files = static_cast<std::size_t>(std::count_if(
        fs::recursive_directory_iterator("tree/made"), fs::recursive_directory_iterator(),
        [](fs::directory_entry const& each) { return each.is_regular_file(); }));
    EXPECT_EQ(files, 3U) << "with the earlier one";
}

// They are read once more for each conversion: the second time it was empty.
TEST(Files, OfFontsAreNoPipesAndNoDevices) {
    write("one.txt", "{\\Fhouse;x}");
    for (std::string const& map : {std::string("/dev/stdin"), std::string("/dev/zero")}) {
        Outcome const result = run("to-rtf --font-map " + map + " one.txt", "[SHX Map]", "cat | ");
        EXPECT_EQ(result.status, 2);
        EXPECT_EQ(result.err, "tzconvert: " + map + ": cannot be read: it is a device or a pipe\n");
    }
}

TEST(Files, ThatMemoryCannotHoldAreNamed) {
#ifdef __SANITIZE_ADDRESS__
    GTEST_SKIP() << "the sanitizer needs the memory that is left out here";
#endif
    fs::create_directories("batch");
    write("big.txt", std::string(30000000, 'a'));
    write("one.txt", "1");
    Outcome const result =
        run("to-mtext --output-dir batch big.txt one.txt", "", "ulimit -v 200000; ");
    EXPECT_EQ(result.status, 2);
    EXPECT_EQ(result.err, "tzconvert: big.txt: memory cannot hold its conversion\n"
                          "tzconvert: 1 of 2 files converted, 1 failed\n");
    fs::remove("big.txt");
    EXPECT_FALSE(fs::exists("batch/big.mtext"));
    EXPECT_EQ(contentsOf("batch/one.mtext"), "1");
}

// The font of the second file used to come back as a face, which the first file had lent to another
// font.
TEST(Files, OfABatchGiveWhatTheyGiveAlone) {
    fs::create_directories("batch");
    write("own.ini", "[SHX Map]\nhouse.shx=Drawn,0,0,0,0\nother.shx=Else,0,0,0,0\n"
                     "[Proxy Fonts]\nProxy 1=Drawn\n");
    write("lends.txt", "\\Fnone;a");
    write("lends2.txt", "\\Fhouse|c1;a");
    write("mapped.txt", "{\\Fhouse|c0;b}");
    for (char const* files :
         {"mapped.txt", "lends.txt mapped.txt", "lends.txt lends2.txt mapped.txt"}) {
        EXPECT_EQ(run("round-trip --font Arial --font-map own.ini --output-dir batch " +
                          std::string(files),
                      "")
                      .status,
                  0);
        EXPECT_EQ(contentsOf("batch/mapped.mtext"), "{\\Fhouse.shx|c0;b}") << files;
    }
}

// The tables are kept from conversion to conversion, yet each begins as if they were filled anew.
TEST(FontTables, HoldWhatTheMapSays) {
    auto const faceOf = [](wchar_t const* file) {
        auto const& table = CMTextFontMapDatabase::m_mapFileToFont;
        auto const at = table.find(CStdStrW(file));
        if (at == table.end()) return std::string("none");
        auto const& entry = static_cast<CMTextFileToFontMapEntry const&>(*at->second);
        return TzString(entry.m_sFaceName).toUtf8();
    };
    auto const lend = [](wchar_t const* file) {
        CMTextFontMapDatabase fonts(0);
        fonts.AddFontSubstitute(file, L"Lent", false, false, kAnsiCharset, 0,
                                CMTextFontMapDatabase::MapTypeProxy, 0);
    };
    write("kept.ini", "[SHX Map]\nhouse.shx=Drawn,0,0,0,0\n");
    std::string const before = tzhost::setFontMapFile("kept.ini");
    tzconvert::FontTables tables;
    tables.prepare();
    auto const* const kept = CMTextFontMapDatabase::m_mapFileToFont.begin()->second;
    lend(L"new.shx");
    tables.prepare();
    EXPECT_EQ(CMTextFontMapDatabase::m_mapFileToFont.begin()->second, kept) << "filled again";
    lend(L"house.shx");
    EXPECT_EQ(faceOf(L"house.shx"), "none");
    tables.prepare();
    EXPECT_EQ(faceOf(L"house.shx"), "Drawn");
    write("kept.ini", "[SHX Map]\nhouse.shx=Other face,0,0,0,0\n");
    tables.prepare();
    EXPECT_EQ(faceOf(L"house.shx"), "Other face");
    CMTextFontMapDatabase(0).ResetContents();
    tzhost::setFontMapFile(before);
}

// A name in plain letters used to be taken for an English one.
TEST(Faces, AreWrittenInEnglish) {
    fs::path const fonts = fs::path(std::getenv("FONTCONFIG_FILE")).parent_path() / "files";
    write("native.conf",
          "<fontconfig><dir>" + fonts.string() + "</dir><cachedir>" +
              fs::absolute("cache").string() +
              "</cachedir><match target=\"scan\"><test name=\"family\"><string>DejaVu Sans Mono"
              "</string></test><edit name=\"family\" mode=\"append\"><string>Gewohnt</string>"
              "</edit><edit name=\"familylang\" mode=\"append\"><string>de</string></edit>"
              "</match></fontconfig>");
    Outcome const result = run("to-mtext", "{\\fonttbl{\\f1\\fcharset0 gewohnt;}}\\f1 x",
                               "export FONTCONFIG_FILE=$PWD/native.conf; ");
    EXPECT_EQ(result.out, "{\\fDejaVu Sans Mono|b0|i0|c0|p0;x}") << result.err;
}

TEST(Files, DoNotOverwriteInputs) {
    write("trip.mtext", "x");
    EXPECT_EQ(run("round-trip --output ./trip.mtext trip.mtext", "").status, 2);
    EXPECT_EQ(contentsOf("trip.mtext"), "x");
    EXPECT_EQ(run("round-trip --output-dir . trip.mtext", "").status, 2);
    EXPECT_EQ(contentsOf("trip.mtext"), "x");
    write("trip.rtf", "y");
    Outcome const result = run("to-rtf --output-dir ../$(basename $PWD) trip.mtext trip.rtf", "");
    EXPECT_EQ(result.status, 2);
    EXPECT_NE(result.err.find("trip.mtext: its result would take the place of"), std::string::npos)
        << result.err;
    EXPECT_EQ(contentsOf("trip.rtf"), "y");
}

// The result used to be written over an input, or over an earlier result.
TEST(Reports, TakeThePlaceOfNothingElse) {
    struct Row {
        char const* arguments;
        char const* reason;
    };
    constexpr Row kRows[] = {
        {"--output text.rtf --report a.mtext a.mtext", "it is an input"},
        {"--output text.rtf --report link.json a.mtext", "it is an input"},
        {"--output-dir made --report $PWD/a.mtext b a.mtext", "it is an input"},
        {"--report own.ini --font-map ./own.ini a.mtext", "it is an input"},
        {"--output ./text.rtf --report text.rtf a.mtext", "a result goes there"},
        {"--output text.rtf --report nowhere.json a.mtext", "a result goes there"},
        {"--output-dir made --report ./made/a.rtf b a.mtext", "a result goes there"},
        {"--output-dir made --report made/stdin.rtf", "a result goes there"},
    };
    fs::remove_all("reports");
    fs::create_directories("reports/made");
    write("reports/a.mtext", "x");
    write("reports/own.ini", "[SHX Map]\n");
    fs::create_symlink("a.mtext", "reports/link.json");
    fs::create_symlink("text.rtf", "reports/nowhere.json");
    for (Row const& row : kRows) {
        Outcome const result = run(std::string("to-rtf ") + row.arguments, "", "cd reports; ");
        EXPECT_EQ(result.status, 2) << row.arguments;
        EXPECT_NE(result.err.find(row.reason), std::string::npos) << row.arguments << result.err;
        EXPECT_EQ(contentsOf("reports/a.mtext"), "x") << row.arguments;
        EXPECT_EQ(contentsOf("reports/own.ini"), "[SHX Map]\n") << row.arguments;
        EXPECT_FALSE(fs::exists("reports/text.rtf")) << row.arguments;
        EXPECT_TRUE(fs::is_empty("reports/made")) << row.arguments;
    }
}

TEST(Reports, NameWhatWasFound) {
    EXPECT_EQ(run("to-rtf --report r.json", "a\\T2;\\K\\A1;\\S1/2;\\H0.4;x").status, 0);
    std::string const report = contentsOf("r.json");
    for (char const* part :
         {"\"incidents\": 1073741825", "\"tracking\": 2.0", "\"baseAlignment\": 1",
          "\"minFontSize\": 28", "\"maxFontSize\": 64", "\"initialFontSize\": 32",
          "\"currentFontSize\": 64", "\"stacksSeen\": true"}) {
        EXPECT_NE(report.find(part), std::string::npos) << part << report;
    }
}

TEST(Codec, ReadsAndWritesAnyMixtureInAnyPieces) {
    for (std::size_t plain : {0U, 1U, 63U, 64U, 65U, 2000U}) {
        std::string const bytes = std::string(plain, 'a') + "\xC3\xA9\xF0\x9F\x98\x80" +
                                  std::string(plain, 'b') + "\xE4\xB8\xAD";
        for (std::size_t piece : {4U, 5U, 7U, 64U, 9000U}) {
            std::wstring text;
            std::size_t read = 0;
            for (std::size_t step = 1; read < bytes.size() && step > 0; read += step) {
                auto const decoded = tzconvert::decodeText(bytes.substr(read, piece), text);
                EXPECT_EQ(decoded.fault, nullptr);
                step = decoded.size;
            }
            std::string back;
            tzconvert::encodeText(text, back);
            EXPECT_EQ(back, bytes);
        }
        std::wstring text;
        auto const bad = tzconvert::decodeText(bytes + "\xC0\x80", text);
        EXPECT_STREQ(bad.fault, "not UTF-8");
        EXPECT_EQ(bad.size, bytes.size());
        EXPECT_EQ(text.size(), 2 * plain + 3);
    }
}

// Only the end of all tells a character that a piece cuts off from one that the text cuts off.
TEST(Codec, LeavesACharacterThatIsCutOff) {
    struct Row {
        char const* bytes;
        std::size_t size;
        bool isOpen;
    };
    constexpr Row kRows[] = {
        {"a\xE4\xB8", 1, true},   {"a\xF0\x9F\x98", 1, true},  {"\xC3", 0, true},
        {"a\xE4\xB8z", 1, false}, {"a\xE4z", 1, false},        {"a\xC1", 1, false},
        {"a\xB8", 1, false},      {"a\xC3\xA9\xF5", 3, false},
    };
    for (Row const& row : kRows) {
        std::wstring text;
        auto const decoded = tzconvert::decodeText(row.bytes, text);
        EXPECT_EQ(decoded.size, row.size) << row.bytes;
        EXPECT_EQ(decoded.fault == nullptr, row.isOpen) << row.bytes;
    }
}

}  // namespace
