// TEXTALIGN in the program with every alignment and spacing, along lines of every kind, in the plan
// and in a tilted plane. Where the texts should stand follows from the sizes that the saved drawing
// gives, so that fonts do not matter.

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <map>
#include <numeric>
#include <vector>

#include "tests/align/flat_box.h"
#include "tests/support/program_run.h"

namespace {

using Json = nlohmann::ordered_json;

// Unequal texts, attached at the lower left; the last one lies behind the first point.
struct GivenNote {
    char const* contents;
    double height;
    TzGePoint3d at;
};
constexpr std::array<GivenNote, 4> kNotes{{
    {"A", 1, {0, 0, 0}},
    {R"(Two\Plines)", 1.5, {9, 5, 0}},
    {"Room 12", 2, {9, -7, 0}},
    {R"(Wide text\Pand\Pthree lines)", 2.5, {-40, -40, 0}},
}};
constexpr std::array<TzGeVector3d, 8> kLines{{{60, 0, 0},
                                              {0, -60, 0},
                                              {40, 40, 0},
                                              {-30, 50, 0},
                                              {60, 0.01, 0},
                                              {-0.01, 60, 0},
                                              {60, 1.1, 0},
                                              {2, 1, 0}}};
// The x axis of each plane; its y axis is the world's.
constexpr std::array<TzGeVector3d, 2> kPlanes{{{1, 0, 0}, {0.6, 0, 0.8}}};
constexpr std::array<char const*, 4> kSpacings{"Distribute", "Set", "Horizontal", "Vertical"};
// Alignment; the point as a share of width and height from the lower left.
std::map<std::string, TzGeVector3d> const kAlignments{
    {"TL", {0, 1, 0}},     {"TC", {0.5, 1, 0}}, {"TR", {1, 1, 0}},    {"ML", {0, 0.5, 0}},
    {"MC", {0.5, 0.5, 0}}, {"MR", {1, 0.5, 0}}, {"BL", {0, 0, 0}},    {"BC", {0.5, 0, 0}},
    {"BR", {1, 0, 0}},     {"Left", {0, 1, 0}}, {"Right", {1, 1, 0}}, {"Center", {0.5, 0.5, 0}},
};
constexpr TzGePoint3d kFirst{2, 3, 0};
constexpr double kGap = 1.75;

struct RunRow {
    TzGeVector3d plane;
    TzGeVector3d line;
    std::string spacing;
    std::string alignment;
};

std::vector<RunRow> everyRun() {
    std::vector<RunRow> runs;
    for (TzGeVector3d const& plane : kPlanes)
        for (TzGeVector3d const& line : kLines)
            for (char const* const spacing : kSpacings)
                for (auto const& [alignment, share] : kAlignments)
                    runs.push_back({plane, line, spacing, alignment});
    return runs;
}

std::string handleOf(std::size_t run, std::size_t note) {
    char text[16];
    std::snprintf(text, sizeof text, "%zX", 0x100 + run * kNotes.size() + note);
    return text;
}

std::string drawingOf(std::vector<RunRow> const& runs) {
    Json drawing{{"format", "tz-drawing"}, {"version", 1}};
    for (std::size_t run = 0; run < runs.size(); ++run) {
        TzGeVector3d const& x = runs[run].plane;
        for (std::size_t note = 0; note < kNotes.size(); ++note) {
            auto const& [contents, height, at] = kNotes[note];
            drawing["entities"].push_back({{"handle", handleOf(run, note)},
                                           {"type", "MTEXT"},
                                           {"location", {x.x * at.x, at.y, x.z * at.x}},
                                           {"direction", {x.x, 0, x.z}},
                                           {"normal", {-x.z, 0, x.x}},
                                           {"textHeight", height},
                                           {"attachment", 7},
                                           {"contents", contents}});
        }
    }
    return drawing.dump();
}

std::string scriptOf(std::vector<RunRow> const& runs) {
    std::string script;
    for (std::size_t at = 0; at < runs.size(); ++at) {
        auto const& [plane, line, spacing, alignment] = runs[at];
        script += "TEXTALIGN\nalIgnment\n" + alignment + "\nOptions\n" + spacing + "\n";
        if (spacing == "Set") script += std::to_string(kGap) + "\n";
        for (std::size_t note = 0; note < kNotes.size(); ++note)
            script += "#" + handleOf(at, note) + " ";
        script += "\n\nPoint\n2,3\n" + std::to_string(kFirst.x + line.x) + "," +
                  std::to_string(kFirst.y + line.y) + "\n";
    }
    return script;
}

// The way of each note of a run, in coordinates of its plane.
using Ways = std::array<TzGeVector3d, kNotes.size()>;

class Expected {
public:
    Expected(RunRow const& run, Ways const& sizes) : run_(run) {
        TzGeVector3d const& share = kAlignments.at(run.alignment);
        for (std::size_t note = 0; note < kNotes.size(); ++note) {
            TzGeVector3d const inset(sizes[note].x * share.x, sizes[note].y * share.y, 0);
            points_[note] = kNotes[note].at + inset;
            boxes_[note] = {TzGePoint3d() - inset, TzGePoint3d() - inset + sizes[note]};
        }
    }
    [[nodiscard]] Ways ways() const {
        return run_.spacing == "Horizontal" || run_.spacing == "Vertical" ? slid() : spread();
    }

private:
    // No way at all where the line runs within a degree of it.
    [[nodiscard]] Ways slid() const {
        Ways ways;
        TzGeVector3d const line = run_.line;
        bool const upDown = run_.spacing == "Horizontal";
        double const slope = upDown ? line.y / line.x : line.x / line.y;
        if (!(std::abs(slope) < std::tan(89 * std::acos(-1.0) / 180))) return ways;
        for (std::size_t note = 0; note < kNotes.size(); ++note) {
            TzGeVector3d const off = points_[note] - kFirst;
            (upDown ? ways[note].y : ways[note].x) =
                upDown ? off.x * slope - off.y : off.y * slope - off.x;
        }
        return ways;
    }
    [[nodiscard]] Ways spread() const {
        TzGeVector3d const along = run_.line.normal();
        std::array<std::size_t, kNotes.size()> order{0, 1, 2, 3};
        std::stable_sort(order.begin(), order.end(), [&](std::size_t a, std::size_t b) {
            return along.dotProduct(points_[a] - points_[b]) < 0;
        });
        std::array<double, kNotes.size()> taken{};
        for (std::size_t i = 1; i < kNotes.size(); ++i)
            taken[i] = tztest::touchingDistance(boxes_[order[i - 1]], boxes_[order[i]], along);
        double const left = run_.line.length() - std::accumulate(taken.begin(), taken.end(), 0.0);
        Ways ways;
        TzGePoint3d place = kFirst;
        for (std::size_t i = 0; i < kNotes.size(); ++i) {
            if (i > 0) place += along * (taken[i] + (run_.spacing == "Set" ? kGap : left / 3));
            ways[order[i]] = place - points_[order[i]];
        }
        return ways;
    }

    RunRow run_;
    std::array<TzGePoint3d, kNotes.size()> points_;
    std::array<tztest::FlatBox, kNotes.size()> boxes_;
};

TEST(Positions, FollowFromTheMeasuredSizes) {
    std::vector<RunRow> const runs = everyRun();
    std::string const start = tztest::scratch("positions.json", drawingOf(runs)).string();
    std::string const script = tztest::scratch("positions.scr", scriptOf(runs)).string();
    std::string const saved = tztest::scratch("positions_after.json").string();
    ASSERT_EQ(tztest::runProgram({start, "--script", script, "--save", saved}).status, 0);
    Json const drawing = Json::parse(tztest::bytesOf(saved));
    Json const& texts = drawing["entities"];
    ASSERT_EQ(texts.size(), runs.size() * kNotes.size());
    Ways sizes;
    for (std::size_t note = 0; note < kNotes.size(); ++note)
        sizes[note] = {texts[note]["measured"]["width"], texts[note]["measured"]["height"], 0};
    for (std::size_t at = 0; at < runs.size(); ++at) {
        auto const& [plane, line, spacing, alignment] = runs[at];
        SCOPED_TRACE(spacing + " " + alignment + " along " + std::to_string(line.x) + "," +
                     std::to_string(line.y) + (plane.z > 0 ? " tilted" : ""));
        Ways const ways = Expected(runs[at], sizes).ways();
        for (std::size_t note = 0; note < kNotes.size(); ++note) {
            TzGePoint3d const wanted = kNotes[note].at + ways[note];
            Json const& found = texts[at * kNotes.size() + note]["location"];
            EXPECT_NEAR(found[0].get<double>(), plane.x * wanted.x, 1e-6) << note;
            EXPECT_NEAR(found[1].get<double>(), wanted.y, 1e-6) << note;
            EXPECT_NEAR(found[2].get<double>(), plane.z * wanted.x, 1e-6) << note;
        }
    }
}

}  // namespace
