#include <gtest/gtest.h>

#include <cmath>
#include <new>
#include <numbers>
#include <string>
#include <utility>

#include "host/base/memory_faults.h"
#include "host/faults/fault_plan.h"
#include "host/layout/line_layout.h"
#include "host/layout/mtext_layout.h"
#include "host/shaping/shape_engine.h"

namespace {

using namespace tzhost;

// Units of the faces' own tables: the advance of any letter, and the height of the H.
struct FaceRow {
    wchar_t const* typeface;
    wchar_t const* text;
    double advance;  // of the whole text
    double capHeight;
};

constexpr FaceRow kFaces[] = {
    {L"DejaVu Sans Mono", L"Sphinx of quartz", 16 * 1233.0, 1493.0},
    {L"DejaVu Sans Mono", L"iiiiiiiiiiiiWWWW", 16 * 1233.0, 1493.0},
    {L"Liberation Sans", L"HiIll", 1479.0 + 455.0 + 569.0 + 455.0 + 455.0, 1409.0},
};

constexpr double kHeights[] = {1e-6, 0.2, 1.0, 1e9};

MTextLayoutInput inputOf(FaceRow const& face, double height) {
    MTextLayoutInput input;
    input.contents = face.text;
    input.textHeight = height;
    input.style.typeface = face.typeface;
    return input;
}

TEST(Measure, AdvancesComeFromTheFaceAtEveryHeight) {
    for (FaceRow const& face : kFaces) {
        for (double const height : kHeights) {
            double const expected = face.advance / face.capHeight * height;
            MTextLayout const layout = layOutMText(inputOf(face, height));
            EXPECT_NEAR(layout.width / expected, 1.0, 1e-9) << height;
            EXPECT_EQ(layout.height, height);
            LineLayoutInput line;
            line.text = face.text;
            line.textHeight = height;
            line.style.typeface = face.typeface;
            EXPECT_NEAR(layOutLine(line).box.right / expected, 1.0, 1e-9) << height;
        }
    }
}

// 90 degrees used to draw endless letters on single lines, and 350 leant multi-line texts by 85.
TEST(Measure, SlantsStayThoseOfLetters) {
    constexpr double kDegree = std::numbers::pi / 180.0;
    for (auto const& [given, drawn] : {std::pair{90.0, 85.0}, {350.0, -10.0}, {-10.0, -10.0}}) {
        MTextLayoutInput input = inputOf(kFaces[0], 1.0);
        LineLayoutInput line;
        line.text = kFaces[0].text;
        line.textHeight = 1.0;
        line.style.oblique = input.style.oblique = given * kDegree;
        EXPECT_NEAR(layOutLine(line).runs.front().oblique, drawn * kDegree, 1e-12) << given;
        EXPECT_NEAR(layOutMText(input).runs.front().oblique, drawn * kDegree, 1e-12);
    }
}

// A face whose making failed half-way used to serve without a height of capitals until the process
// ended.
TEST(Measure, FacesAreKeptWholeWhicheverAllocationFails) {
    bool struck = true;
    for (int call = 1; struck && call < 50; ++call) {
        // A new face each time, with a name that does not fit into a string object.
        LayoutFace const face{L"A typeface that nobody has, number " + std::to_wstring(call), false,
                              false};
        FaultPlan plan;
        ASSERT_FALSE(plan.add("operator new:" + std::to_string(call)));
        plan.install();
        try {
            MemoryFaultScope const command;
            (void)ShapeEngine::instance().face(face);
        } catch (std::bad_alloc const&) {
            EXPECT_TRUE(plan.hasStruck());
        }
        plan.remove();
        struck = plan.hasStruck();
        EXPECT_NE(ShapeEngine::instance().face(face).description, nullptr) << call;
        EXPECT_GT(ShapeEngine::instance().face(face).capHeight, 0.0) << call;
    }
    EXPECT_FALSE(struck) << "the sweep came to its end";
}

// Wrapped at 5.5 letters the words "aaaa" stand one to a line.
TEST(Measure, WrappedLinesMeasureAlikeAtEveryHeight) {
    for (double const height : kHeights) {
        double const letter = 1233.0 / 1493.0 * height;
        MTextLayoutInput input = inputOf({L"DejaVu Sans Mono", L"aaaa aaaa aaaa", 0, 0}, height);
        input.width = 5.5 * letter;
        MTextLayout const layout = layOutMText(input);
        ASSERT_EQ(layout.lines.size(), 3U) << height;
        EXPECT_NEAR(layout.width / (4.0 * letter), 1.0, 1e-9);
        EXPECT_NEAR(layout.height / (height * (1.0 + 2.0 * 5.0 / 3.0)), 1.0, 1e-12);
        // A width of exactly the letters holds them, one a little narrower does not.
        input.width = 9.0 * letter;
        EXPECT_EQ(layOutMText(input).lines.size(), 2U) << height;
        input.width = 8.9999 * letter;
        EXPECT_EQ(layOutMText(input).lines.size(), 3U) << height;
    }
}

TEST(Measure, LongTextsAddUpWithoutDrift) {
    std::wstring const text(200000, L'x');
    MTextLayoutInput input = inputOf({L"DejaVu Sans Mono", text.c_str(), 0, 0}, 1493.0);
    EXPECT_NEAR(layOutMText(input).width / (200000.0 * 1233.0), 1.0, 1e-9);
}

struct StyleRow {
    char const* name;
    wchar_t const* contents;
    double widthFactor;
    double letters;  // how wide the text is, in letters
};

constexpr StyleRow kStyles[] = {
    {"PlainStyle", L"abc", 1.0, 3.0},
    {"StyleFactor", L"abc", 0.5, 1.5},
    {"CodeFactorMultiplies", L"\\W2;abc", 0.5, 3.0},
    {"AccentsJoin", L"e\u0301x", 1.0, 2.0},
    {"Tracking", L"\\T1.5;abc", 1.0, 4.5},
    {"NegativeFactorIsNone", L"\\W-2;abc", 1.0, 3.0},
    {"ZeroStyleFactorIsNone", L"abc", 0.0, 3.0},
    {"Unknown face still measures", L"", 1.0, 0.0},
};

TEST(Measure, FactorsScaleAdvances) {
    for (StyleRow const& row : kStyles) {
        MTextLayoutInput input = inputOf({L"DejaVu Sans Mono", row.contents, 0, 0}, 1493.0);
        input.style.widthFactor = row.widthFactor;
        EXPECT_NEAR(layOutMText(input).width, row.letters * 1233.0, 1e-6) << row.name;
    }
}

struct FontRow {
    wchar_t const* file;
    wchar_t const* typeface;
};

// A stroke font is drawn with a face of the table, an installed file with its own.
constexpr FontRow kFontFiles[] = {
    {L"txt.shx", L"DejaVu Sans"},
    {L"C:\\fonts\\MonoTxt.SHX", L"DejaVu Sans Mono"},
    {L"DejaVuSansMono.ttf", L"DejaVu Sans Mono"},
    {L"missing.ttf", L"DejaVu Sans"},
    {L"", L"DejaVu Sans"},
};

TEST(Measure, FontFilesStandForFaces) {
    for (FontRow const& row : kFontFiles) {
        MTextLayoutInput byFile = inputOf({L"", L"Wide and lit", 0, 0}, 1.0);
        byFile.style.fontFile = row.file;
        MTextLayoutInput const byFace = inputOf({row.typeface, L"Wide and lit", 0, 0}, 1.0);
        EXPECT_EQ(layOutMText(byFile).width, layOutMText(byFace).width);
    }
}

}  // namespace
