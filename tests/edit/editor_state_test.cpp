// One editing session: its sizes from the registry, its colours, its styles, and its text in two
// forms.

#include <gtest/gtest.h>

#include <cstdlib>

#include "host/settings/settings.h"
#include "host/text/utf8.h"
#include "module/markup/session/conversion_session.h"
#include "tests/mtext/held_text.h"
#include "tests/support/program_run.h"
#include "tz/mte/editor_state.h"
#include "tz/mte/globals.h"

namespace {

// Settings and exported variables as a session finds them, given back at the end.
class Surroundings {
public:
    explicit Surroundings(std::string const& registry) : before_(tzhost::settings()) {
        auto read =
            tzhost::readSettings(R"({"registry": {"HKEY_CURRENT_USER": {)" + registry + "}}}");
        EXPECT_EQ(read.error, "");
        tzhost::settings() = std::move(read.settings);
    }
    Surroundings(Surroundings const&) = delete;
    Surroundings& operator=(Surroundings const&) = delete;
    ~Surroundings() {
        tzhost::settings() = std::move(before_);
        gMTextFixed = 0;
        giPoints = 16;
        g_dTextSize = 0.0;
    }

private:
    tzhost::Settings before_;
};

struct PointRow {
    char const* name;
    char const* registry;
    bool isFixed;
    int points;  // giPoints before the session
    int initial, most, least;
    int pointsAfter;
};
constexpr PointRow kPointRows[] = {
    {"NoRegistry", "", false, 16, 320, 2560, 120, 16},
    {"ScreenSizeCounts", R"("Normal Point Size": 40)", false, 20, 400, 2560, 120, 20},
    {"FixedWindow", R"("Normal Point Size": 40)", true, 20, 800, 2560, 120, 40},
    {"NormalTooSmall", R"("Normal Point Size": 4)", true, 16, 160, 2560, 120, 4},
    {"NormalTooLarge", R"("Normal Point Size": 100)", true, 16, 1440, 2560, 120, 100},
    {"NormalBeyondInt", R"("Normal Point Size": 4294967295)", true, 16, 1440, 2560, 120, INT_MAX},
    {"NormalIsText", R"("Normal Point Size": "40")", true, 30, 320, 2560, 120, 16},
    {"MostBelowNormal", R"("Max Point Size": 10)", false, 16, 320, 320, 120, 16},
    {"MostTooLarge", R"("Max Point Size": 300)", false, 16, 320, 5120, 120, 16},
    {"LeastIgnored", R"("Min Point Size": 5)", false, 16, 320, 2560, 120, 16},
    {"LeastAboveNormal", R"("Min Point Size": 20)", false, 16, 320, 2560, 320, 16},
    {"LeastTaken", R"("Min Point Size": 10)", false, 16, 320, 2560, 200, 16},
};

TEST(EditorState, TakesItsPointsFromTheRegistry) {
    OpenDrawing const drawing;
    for (PointRow const& row : kPointRows) {
        SCOPED_TRACE(row.name);
        Surroundings const surroundings(row.registry);
        gMTextFixed = row.isFixed ? 1 : 0;
        giPoints = row.points;
        CMTextEditorState const state;
        EXPECT_EQ(state.GetInitialTwipSize(), row.initial);
        EXPECT_EQ(state.GetMaximumTwipSize(), row.most);
        EXPECT_EQ(state.GetMinimumTwipSize(), row.least);
        EXPECT_EQ(giPoints, row.pointsAfter);
    }
}

TEST(EditorState, KeepsTheColoursOfLayerAndBlockApart) {
    OpenDrawing const drawing;
    CMTextEditorState state;
    state.SetByLayerColor(0x10);
    state.SetByBlockColor(0x10);
    EXPECT_EQ(state.GetByBlockColor(), 0x11U);
    state.SetByLayerColor(0x11);
    EXPECT_EQ(state.GetByLayerColor(), 0x10U);
    state.SetVerticalAlignment(kAlignTop);
    state.SetVerticalAlignment(static_cast<VerticalAlignment>(3));
    EXPECT_EQ(state.GetVerticalAlignment(), kAlignTop);
}

TEST(EditorState, BeginsAsTheDrawingSays) {
    OpenDrawing const drawing;
    CMTextEditorInterface* const editor = new_CMTextEditorInterface();
    EXPECT_EQ(editor->GetInitialSize(), 0.2);
    EXPECT_EQ(editor->GetInitialColor(), 0xFFFFFFU);
    EXPECT_EQ(editor->GetStyle(), L"Standard");
    EXPECT_EQ(editor->GetBkColor(), 0U);
    delete_CMTextEditorInterface(editor);
    delete_CMTextEditorInterface(nullptr);
}

void addStyle(wchar_t const* name, double height, wchar_t const* face, wchar_t const* big) {
    EasyTable<TzDbTextStyleTable> table;
    ASSERT_EQ(tzhost::workingDrawing()->getTextStyleTable(table.object, TzDb::kForWrite),
              Tzad::eOk);
    auto record = std::make_unique<TzDbTextStyleTableRecord>();
    EXPECT_EQ(record->setName(name), Tzad::eOk);
    EXPECT_EQ(record->setTextSize(height), Tzad::eOk);
    EXPECT_EQ(record->setFileName(L"romans.shx"), Tzad::eOk);
    EXPECT_EQ(record->setBigFontFileName(big), Tzad::eOk);
    EXPECT_EQ(record->setFont(face, true, false, 161, 34), Tzad::eOk);
    TzDbObjectId id;
    ASSERT_EQ(table->addRecord(record.get(), id), Tzad::eOk);
    (void)record.release()->close();
}

TEST(EditorState, LoadsTheStylesOnce) {
    OpenDrawing const drawing;
    addStyle(L"Titles", 5.0, L"DejaVu Sans", L"");
    addStyle(L"Pair", 0.0, L"", L"bigfont.shx");
    CMTextEditorState state;
    state.SetInitialSize(2.5);
    state.LoadStyles();
    int at = 0;
    CStyleInfoEntry entry;
    ASSERT_TRUE(state.FindStyle(L"TITLES", at));
    ASSERT_TRUE(state.GetStyleInfo(at, entry));
    EXPECT_EQ(entry.height, 5.0);
    EXPECT_FALSE(entry.heightIsInitialSize);
    EXPECT_EQ(entry.typeface, L"DejaVu Sans");
    EXPECT_EQ(entry.charset, kGreekCharset);
    ASSERT_TRUE(state.FindStyle(L"Pair", at));
    ASSERT_TRUE(state.GetStyleInfo(at, entry));
    EXPECT_EQ(entry.height, 2.5);
    EXPECT_TRUE(entry.heightIsInitialSize);
    EXPECT_EQ(entry.fileName, L"romans.shx,bigfont.shx");
    EXPECT_FALSE(entry.typeface.isEmpty());
    addStyle(L"Later", 0.0, L"DejaVu Sans", L"");
    state.LoadStyles();
    EXPECT_FALSE(state.FindStyle(L"Later", at));
    EXPECT_EQ(at, -1);
    EXPECT_FALSE(state.GetStyleInfo(99, entry));
}

// When the style is gone, a message stands in the place of the document and of the markup.
TEST(EditorState, SaysInTheTextThatItsStyleIsGone) {
    OpenDrawing const drawing;
    CMTextEditorState state;
    state.SetInitialSize(0.2);
    state.SetStyle(L"Gone");
    state.SetMTextString(L"A");
    CStdStrW other;
    state.GetRTFString(other);
    EXPECT_EQ(other, L"\b1FindStyle\b0(GetStyle(), iStyleIndex) == FALSE");
    state.SetRTFString(L"{\\rtf1 A}");
    state.GetMTextString(other);
    EXPECT_EQ(other, L"FindStyle(GetStyle(), iStyleIndex) == FALSE");
}

// A text as it comes back in the form that it was given in, and by way of the other one.
TEST(EditorState, ConvertsOnEachReading) {
    OpenDrawing const drawing;
    Surroundings const surroundings("");
    g_dTextSize = 0.2;
    CMTextEditorState state;
    state.SetInitialSize(0.2);
    state.SetStyle(L"Standard");
    CStdStrW const markup = L"{\\H0.35;\\LA\\l}\\P\\C1;B \\T1.5;";
    CStdStrW text;
    state.SetMTextString(markup);
    state.GetMTextString(text);
    EXPECT_EQ(text, markup);
    CStdStrW rtf;
    state.GetRTFString(rtf);
    ASSERT_EQ(rtf.find(L"{\\rtf"), 0U);
    EXPECT_EQ(state.GetConversionResults(), 0x1U);  // the tracking came after text
    EXPECT_EQ(state.GetTracking(), 1.5);
    state.SetRTFString(rtf);
    state.GetMTextString(text);
    EXPECT_NE(text.find(L"\\T1.5;"), CStdStrW::npos) << TzString(text).toUtf8();
    EXPECT_NE(text.find(L"\\H1.75x;"), CStdStrW::npos) << TzString(text).toUtf8();
    EXPECT_EQ(state.GetConversionResults(), 0x1U);
}

// What the program makes of a markup with the font, size and colour of the test below.
std::string tripByTheProgram(std::wstring_view markup) {
    std::string const input = tztest::scratch("trip.txt", tzhost::toUtf8(markup)).string();
    std::string const output = tztest::scratch("trip.out").string();
    std::string const command = std::string(std::getenv("TZ_TEST_BIN")) +
                                "/tzconvert round-trip --font-file txt.shx --size 0.5 --twips 320 "
                                "--by-layer 0000FF --output " +
                                output + " " + input;
    EXPECT_EQ(std::system(command.c_str()), 0);
    return tztest::bytesOf(output);
}

// A trip through a state is that of a converter with the same face, colours, size and twips.
TEST(EditorState, ConvertsAsAConverterDoes) {
    OpenDrawing const drawing;
    Surroundings const surroundings("");
    g_dTextSize = 0.5;
    CMTextEditorState state;
    state.SetInitialSize(0.5);
    state.SetStyle(L"Standard");
    state.SetByLayerColor(0xFF0000);
    state.LoadStyles();
    CStyleInfoEntry style;
    ASSERT_TRUE(state.GetStyleInfo(0, style));
    TextStart start;
    start.font = {style.typeface, style.bold,           style.italic,
                  style.charset,  style.pitchAndFamily, style.fileName};
    start.size = 0.5;
    start.twips = 320;
    start.byLayer = 0xFF0000;
    for (wchar_t const* markup : {L"{\\H0.35;\\LA\\l}\\P\\C5;B \\T1.5;\\A1;\\S1/2;",
                                  L"{\\fArial|b1|i0|c204|p34;x}\\pi1,t2,3;\t\\U+0416"}) {
        ConversionSession session(start);
        WrittenRtf const written = session.toRtf(markup);
        CStdStrW rtf;
        CStdStrW text;
        state.SetMTextString(markup);
        state.GetRTFString(rtf);
        EXPECT_EQ(rtf, written.rtf);
        state.SetRTFString(rtf);
        state.GetMTextString(text);
        EXPECT_EQ(text, session.toMarkup(rtf, written.found.wholeText).markup);
        EXPECT_EQ(tzhost::toUtf8(text), tripByTheProgram(markup));
    }
}

TEST(EditorState, MeasuresMarginsByTheTextSize) {
    OpenDrawing const drawing;
    Surroundings const surroundings("");
    g_dTextSize = 0.2;
    CMTextEditorState state;
    state.SetInitialSize(0.2);
    // 320 twips * (10 / 0.2) * 0.72
    EXPECT_EQ(state.CalcMarginFromWidth(10.0), 11520);
    EXPECT_DOUBLE_EQ(state.CalcWidthFromMargin(11520), 10.0);
    // LUPREC 4 shows 0.20005 as 0.2001: 320.16, rounded up to tens.
    EXPECT_EQ(state.TwipsAdjustedForLinearUnits(320), 320);
    EXPECT_EQ(state.UnitsToTwips(0.001, 1), 10);
    EXPECT_EQ(state.UnitsToTwips(0.001, 0), 1);
    EXPECT_EQ(state.TwipsToUnits(10, 1), 0.001);
}

}  // namespace
