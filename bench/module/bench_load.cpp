// Loading the module, with no drawing open. The floor is what no load can do without: the dynamic
// loader's work on the same file, and opening the resource library.
#include <benchmark/benchmark.h>

#include <dlfcn.h>

#include <filesystem>
#include <memory>
#include <string>

#include "bench/support/against_floor.h"
#include "host/files/install_paths.h"
#include "host/fonts/font_map_path.h"
#include "host/runtime/module_linker.h"
#include "tz/rx/resource.h"

namespace {

namespace fs = std::filesystem;

constexpr double kMost = 3.0;

fs::path library(char const* name) {
    return fs::path(tzhost::libraryFolder()) / name;
}

// The two parts of the floor, both held until they were timed.
struct Opened {
    std::unique_ptr<void, int (*)(void*)> module;
    TzRxResourceInstance texts;
};

Opened openBoth(fs::path const& module) {
    return {{dlopen(module.c_str(), RTLD_NOW | RTLD_LOCAL), dlclose},
            TzRxResourceInstance(L"TzmtedRes.dll")};
}

// Unloads the module at its end.
struct Loaded {
    explicit Loaded(fs::path const& module)
        : file(module), succeeded(tzhost::dynamicLinker().load(module, error)) {}
    Loaded(Loaded const&) = delete;
    Loaded& operator=(Loaded const&) = delete;
    ~Loaded() { (void)tzhost::dynamicLinker().unload(file, error); }  // the next load would fail

    std::string error;
    fs::path const& file;
    bool succeeded;
};

// A copy of the shipped font map that looks changed before each load, so that every load reads it.
class ChangingFontMap {
public:
    ChangingFontMap() {
        fs::copy_file(library("TzmtedFonts.ini"), file_, fs::copy_options::overwrite_existing);
        before_ = tzhost::setFontMapFile(file_.string());
    }
    ChangingFontMap(ChangingFontMap const&) = delete;
    ChangingFontMap& operator=(ChangingFontMap const&) = delete;
    ~ChangingFontMap() {
        tzhost::setFontMapFile(before_);
        std::error_code ignored;
        fs::remove(file_, ignored);
    }
    void change() const { fs::last_write_time(file_, fs::file_time_type::clock::now()); }

private:
    fs::path file_ = fs::temp_directory_path() / "bench_load_fonts.ini";
    std::string before_;
};

void loadModule(benchmark::State& state) {
    fs::path const module = library("tzmted.tzx");
    ChangingFontMap const fonts;
    tzbench::AgainstFloor against(state, kMost);
    while (state.KeepRunning()) {
        fonts.change();
        against.turn(
            [&] {
                auto loaded = std::make_unique<Loaded>(module);
                if (!loaded->succeeded) state.SkipWithError(loaded->error.c_str());
                return loaded;
            },
            [&] { return openBoth(module); });
    }
}
BENCHMARK(loadModule)->UseManualTime()->Unit(benchmark::kMicrosecond);

}  // namespace
