// Loading the module file again and again: it leaves the process, its memory comes back, and its
// texts are read anew.

#include <gtest/gtest.h>
#include <malloc.h>

#include <filesystem>
#include <fstream>
#include <map>
#include <memory>
#include <utility>

#include "host/base/event_sink.h"
#include "host/base/memory_faults.h"
#include "host/command_line/command_line.h"
#include "host/database/drawing.h"
#include "host/faults/fault_plan.h"
#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"
#include "host/resources/resource_search.h"
#include "host/runtime/class_registry.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/documents.h"
#include "host/runtime/functions.h"
#include "host/runtime/module_linker.h"
#include "tz/text/string.h"

namespace {

namespace fs = std::filesystem;

std::string member(tzhost::Event const& event, char const* name) {
    auto const at = event.find(name);
    if (at == event.end()) return {};
    return " " + (at->is_string() ? at->get<std::string>() : at->dump());
}

// A printed text, or a name that was registered with what else was handed over.
std::string lineOf(tzhost::Event const& event) {
    if (event["event"] == "print") return "print" + member(event, "text") + "\n";
    if (event["event"] != "register" || event["on"] == false) return {};
    std::string line = event["what"];
    for (char const* const name : {"name", "local", "group", "flags", "code", "topic"})
        line += member(event, name);
    return line + "\n";
}

class Loading : public testing::Test {
protected:
    Loading() {
        tzhost::commandLine().reset();
        tzhost::commandLine().attach();
        tzhost::setWorkingDrawing(drawing_.get());
        tzhost::documents().open(drawing_.get());
        tzhost::setEventSink([this](tzhost::Event const& event) { events_ += lineOf(event); });
    }
    ~Loading() override {
        tzhost::dynamicLinker().unloadAll();
        tzhost::setEventSink({});
        (void)tzhost::setResourceSearch({});
        tzhost::documents().close();
        tzhost::setWorkingDrawing(nullptr);
        tzhost::commandLine().reset();
    }

    static void useResources(fs::path const& file) {
        (void)tzhost::setResourceSearch({"", "", file.string()});
    }
    // Makes the module find its resources with some texts changed.
    static void changeTexts(std::map<unsigned, std::wstring> const& texts) {
        std::string const shipped = tzhost::libraryFolder() + "/TzmtedRes.dll";
        auto const library =
            tzhost::ResourceFile::fromBytes(tzhost::readFile(shipped).value_or(""));
        ASSERT_TRUE(library);
        tzhost::ResourceTexts all = library->all();
        for (auto const& [id, text] : texts)
            all[id] = text;
        std::ofstream("changed.dll", std::ios::binary) << tzhost::writeResourceFile(all);
        useResources(fs::absolute("changed.dll"));
    }

    // Empty when the module is loaded or unloaded.
    static std::string load() {
        std::string error;
        (void)tzhost::dynamicLinker().load(file(), error);
        return error;
    }
    static std::string unload() {
        std::string error;
        (void)tzhost::dynamicLinker().unload(file(), error);
        return error;
    }
    static fs::path file() { return fs::path(tzhost::libraryFolder()) / "tzmted.tzx"; }
    static bool isMapped() {
        std::ifstream maps("/proc/self/maps");
        for (std::string line; std::getline(maps, line);)
            if (line.find("tzmted.tzx") != std::string::npos) return true;
        return false;
    }
    [[nodiscard]] std::string takeEvents() { return std::exchange(events_, {}); }

private:
    std::unique_ptr<tzhost::Drawing> drawing_ = tzhost::Drawing::create();
    std::string events_;
};

constexpr int kRounds = 1000;
constexpr int kWarmUp = 10;  // what the host keeps for good is made in the first rounds
// Of all rounds together; the loader's own lists grow and shrink by steps.
constexpr std::ptrdiff_t kSlack = 8192;

std::ptrdiff_t bytesInUse() {
    return static_cast<std::ptrdiff_t>(mallinfo2().uordblks);
}

TEST_F(Loading, AThousandTimesLeavesMemoryAndProcessAsTheyWere) {
    std::ptrdiff_t before = 0;
    for (int round = 0; round < kRounds + kWarmUp; ++round) {
        if (round == kWarmUp) before = bytesInUse();
        ASSERT_EQ(load(), "") << "round " << round;
        ASSERT_EQ(unload(), "") << "round " << round;
        ASSERT_FALSE(isMapped()) << "round " << round;
        (void)takeEvents();
    }
    EXPECT_LT(bytesInUse() - before, kSlack);
}

// It used to stay listed when its first message passed an exception.
TEST_F(Loading, WithoutMemoryForItLeavesNothing) {
    constexpr int kCalls = 400;  // loading makes some hundreds
    for (int call = 1; call <= kCalls; call += 3) {
        tzhost::FaultPlan plan;
        ASSERT_FALSE(plan.add("operator new:" + std::to_string(call)));
        plan.install();
        std::string error = "thrown";
        try {
            tzhost::MemoryFaultScope const memory;
            error = load();
        } catch (std::bad_alloc const&) {
            // The host itself lacked memory.
        }
        plan.remove();
        if (error.empty()) {
            EXPECT_EQ(unload(), "") << call;
        }
        ASSERT_TRUE(tzhost::dynamicLinker().modules().empty()) << call << ": " << error;
        ASSERT_FALSE(isMapped()) << call << ": " << error;
    }
    EXPECT_EQ(load(), "");
}

// One language for as long as the module is loaded; the next load reads its texts again.
TEST_F(Loading, ReadsItsTextsAgain) {
    for (wchar_t const* const text : {L"\nFirst.", L"\nSecond."}) {
        changeTexts({{163, text}});
        ASSERT_EQ(load(), "");
        useResources("nosuch.dll");
        (void)takeEvents();
        EXPECT_EQ(tzhost::callFunction(L"MTEDIT", nullptr), TzRx::kRetOK);
        EXPECT_EQ(takeEvents(), "print " + TzString(text).toUtf8() + "\n");
        ASSERT_EQ(unload(), "");
    }
}

// Names that differ show which of the two is handed over; topics are the global ones.
TEST_F(Loading, RegistersLocalNamesBesideTheGlobalOnes) {
    changeTexts({{143, L"L143"},
                 {18372, L"L18372"},
                 {127, L"L127"},
                 {1062, L"L1062"},
                 {1063, L"L1063"},
                 {1082, L"L1082"},
                 {52328, L"L52328"}});
    ASSERT_EQ(load(), "");
    std::string const seen = takeEvents();
    EXPECT_EQ(seen.substr(seen.find("command ")), R"(command MTEDIT L143 TZCORE_MTEXT 2
help MTEDIT MTEDIT
help L143 MTEDIT
command -MTEDIT L18372 TZCORE_MTEXT 2
help -MTEDIT -MTEDIT
help L18372 -MTEDIT
command TEXTALIGN L127 TZCORE_MTEXT 2
help TEXTALIGN TEXTALIGN
help L127 TEXTALIGN
command MTEXT L1062 TZCORE_MTEXT 2
help MTEXT MTEXT
help L1062 MTEXT
command -MTEXT L1063 TZCORE_MTEXT 2
help -MTEXT -MTEXT
help L1063 -MTEXT
command MTPROP L1082 TZCORE_MTEXT 2
help MTPROP MTPROP
help L1082 MTPROP
command MTEXTPROPERTIES L52328 TZCORE_MTEXT 8388610
function MTEDIT 0
function TEXTALIGN 4
function MTPROP 1
help MTEDIT MTEDIT
help L143 MTEDIT
help TEXTALIGN TEXTALIGN
help L127 TEXTALIGN
)");
}

// What a load that came to nothing must leave as it was.
struct Registered {
    std::size_t commands = tzhost::commandStack().commands().size();
    bool function = tzhost::documents().current()->functions.find(L"MTEDIT") != nullptr;

    bool operator==(Registered const&) const = default;
};

TEST_F(Loading, LeavesNothingWhenTheTextsAreMissingOrDamaged) {
    std::ofstream("damaged.dll") << "no library of texts";
    ASSERT_EQ(load(), "");
    ASSERT_EQ(unload(), "");
    (void)takeEvents();
    Registered const before;
    for (char const* const name : {"nosuch.dll", "damaged.dll"}) {
        useResources(fs::absolute(name));
        EXPECT_EQ(load(), file().string() + ": the module refused to start (status 3)");
        EXPECT_EQ(Registered(), before);
        EXPECT_FALSE(isMapped());
    }
    EXPECT_EQ(takeEvents(), "");
}

TEST_F(Loading, TwiceIsRefused) {
    ASSERT_EQ(load(), "");
    EXPECT_EQ(load(), file().string() + ": this module is loaded already");
    EXPECT_EQ(unload(), "");
    EXPECT_EQ(unload(), file().string() + ": no module of that name is loaded");
}

}  // namespace
