// Look-ups in the two font tables, by the names that texts hold. The floor is a find in an ordered
// map of the same size, with keys that are ready.
#include <benchmark/benchmark.h>

#include <algorithm>
#include <map>
#include <random>
#include <string>
#include <vector>

#include "bench/support/against_floor.h"
#include "tz/mte/font_map_database.h"

namespace {

using Fonts = CMTextFontMapDatabase;

constexpr int kCalls = 2000;
constexpr int kPitch = 34;

struct Font {
    CStdStrW file;
    CStdStrW face;
};

// In no order, as texts name them; files as they stand in texts, with capitals.
std::vector<Font> fontsOf(benchmark::State const& state) {
    std::vector<Font> fonts;
    for (int i = 0; i < state.range(0); ++i) {
        std::wstring const number = std::to_wstring(i);
        fonts.push_back({L"Font" + number + L".shx", L"Font Family " + number});
    }
    std::shuffle(fonts.begin(), fonts.end(), std::mt19937(1));
    return fonts;
}

// While it lives, the tables hold these fonts and no others.
class FilledTables {
public:
    explicit FilledTables(std::vector<Font> const& fonts) {
        database.ResetContents();
        for (Font const& font : fonts)
            database.AddFontSubstitute(font.file, font.face, false, false, kAnsiCharset, kPitch,
                                       Fonts::MapTypeShx, 0);
    }
    FilledTables(FilledTables const&) = delete;
    FilledTables& operator=(FilledTables const&) = delete;
    ~FilledTables() { database.ResetContents(); }

    Fonts database{0};
};

// Bounds by the size of the tables: what a look-up adds to the find weighs most in small ones.
double boundOf(benchmark::State const& state) {
    return state.range(0) <= 10 ? 6.0 : state.range(0) <= 200 ? 4.0 : 3.0;
}

// Walks round and round over a list.
template <class T>
class Round {
public:
    explicit Round(std::vector<T> const& all) : all_(all) {}
    T const& next() {
        if (++at_ == all_.size()) at_ = 0;
        return all_[at_];
    }

private:
    std::vector<T> const& all_;
    std::size_t at_ = 0;
};

// `look` makes one look-up for a font in our tables, `keyOf` the key for the floor's map.
template <class KeyOf, class Look>
void lookUp(benchmark::State& state, KeyOf keyOf, Look look) {
    std::vector<Font> const fonts = fontsOf(state);
    FilledTables tables(fonts);
    std::vector<CStdStrW> keys;
    std::map<CStdStrW, int> floor;
    for (Font const& font : fonts) {
        keys.push_back(keyOf(font));
        floor.emplace(keys.back(), 1);
    }
    Round<Font> fontRound(fonts);
    Round<CStdStrW> keyRound(keys);
    tzbench::AgainstFloor against(state, boundOf(state), kCalls);
    while (state.KeepRunning())
        against.turn([&] { return look(tables.database, fontRound.next()).size(); },
                     [&] { return floor.find(keyRound.next())->second; });
}

void fileToFont(benchmark::State& state) {
    auto const keyOf = [](Font const& font) {
        CStdStrW key = font.file;
        key.MakeLower();
        return key;
    };
    lookUp(state, keyOf, [](Fonts& database, Font const& font) {
        Fonts::MapType type = Fonts::MapTypeAll;
        bool bold = false;
        bool italic = false;
        Charset charset = kAnsiCharset;
        int pitch = 0;
        return database.MapFileToFont(type, font.file, bold, italic, charset, pitch);
    });
}

void fontToFile(benchmark::State& state) {
    auto const keyOf = [](Font const& font) {
        return BuildFontDescription(font.face, false, false, kAnsiCharset, kPitch);
    };
    lookUp(state, keyOf, [](Fonts& database, Font const& font) {
        Fonts::MapType type = Fonts::MapTypeAll;
        return database.MapFontToFile(type, font.face, false, false, kAnsiCharset, kPitch);
    });
}

BENCHMARK(fileToFont)->Arg(10)->Arg(200)->Arg(2000)->UseManualTime();
BENCHMARK(fontToFile)->Arg(10)->Arg(200)->Arg(2000)->UseManualTime();

}  // namespace
