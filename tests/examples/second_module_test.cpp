// The module of examples/second_module beside the text module: its commands call each kind of the
// host's operations and what the text module offers to others.

#include <gtest/gtest.h>

#include <fstream>

#include "host/files/install_paths.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/module_linker.h"
#include "tests/support/session_cases.h"

namespace {

class SecondModule : public testing::TestWithParam<tztest::SessionCase> {};
TEST_P(SecondModule, ShowsAndDoes) {
    tztest::expectSession(GetParam());
}
INSTANTIATE_TEST_SUITE_P(Cases,
                         SecondModule,
                         testing::ValuesIn(tztest::readCases("examples/second_module.txt")),
                         tztest::nameOfCase);

// Loads and unloads without a drawing.
class SecondModuleFile : public testing::Test {
protected:
    ~SecondModuleFile() override { tzhost::dynamicLinker().unloadAll(); }

    // Empty when it was loaded or unloaded.
    static std::string load(char const* name) {
        std::string error;
        (void)tzhost::dynamicLinker().load(fileOf(name), error);
        return error;
    }
    static std::string unload(char const* name) {
        std::string error;
        (void)tzhost::dynamicLinker().unload(fileOf(name), error);
        return error;
    }
    static bool isMapped(char const* name) {
        std::ifstream maps("/proc/self/maps");
        for (std::string line; std::getline(maps, line);)
            if (line.find(name) != std::string::npos) return true;
        return false;
    }

private:
    static std::filesystem::path fileOf(char const* name) {
        return std::filesystem::path(tzhost::libraryFolder()) / name;
    }
};

TEST_F(SecondModuleFile, NeedsTheTextModule) {
    EXPECT_NE(load("sheetmarks.tzx").find("refused to start (status 3)"), std::string::npos);
    EXPECT_EQ(tzhost::commandStack().find(L"MARK"), nullptr);
    EXPECT_FALSE(isMapped("sheetmarks.tzx"));
    EXPECT_FALSE(isMapped("tzmted.tzx")) << "nothing else uses it";
}

// It is bound to the text module's file, which stays in the process as long as it is needed.
TEST_F(SecondModuleFile, HoldsTheTextModulesFile) {
    ASSERT_EQ(load("tzmted.tzx"), "");
    ASSERT_EQ(load("sheetmarks.tzx"), "");
    EXPECT_EQ(unload("tzmted.tzx"), "");
    EXPECT_TRUE(isMapped("tzmted.tzx"));
    EXPECT_EQ(unload("sheetmarks.tzx"), "");
    EXPECT_FALSE(isMapped("sheetmarks.tzx"));
    EXPECT_FALSE(isMapped("tzmted.tzx"));
    EXPECT_EQ(load("tzmted.tzx"), "");
}

}  // namespace
