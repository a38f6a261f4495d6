// Whole files: what a safe write leaves behind when it works and when it does not.

#include <gtest/gtest.h>

#include <csignal>
#include <cstddef>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <vector>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "host/files/file_bytes.h"
#include "host/files/file_kind.h"
#include "host/files/install_paths.h"
#include "host/files/safe_file.h"
#include "host/files/safe_files.h"

namespace {

namespace fs = std::filesystem;

class FileBytes : public testing::Test {
protected:
    FileBytes() : folder_(fs::temp_directory_path() / "tz-file-test") {
        fs::remove_all(folder_);
        fs::create_directories(folder_);
    }
    ~FileBytes() override { fs::remove_all(folder_); }

    [[nodiscard]] std::string path(char const* name) const { return (folder_ / name).string(); }
    [[nodiscard]] std::ptrdiff_t filesThere() const {
        return std::distance(fs::directory_iterator(folder_), fs::directory_iterator());
    }

    fs::path folder_;
};

TEST_F(FileBytes, ComeBackAsTheyWere) {
    std::string bytes = "zero \0 and \xFF";
    bytes.resize(200000, 'x');
    ASSERT_TRUE(tzhost::writeFileSafely(path("a"), bytes));
    EXPECT_EQ(tzhost::readFile(path("a")), bytes);
    ASSERT_TRUE(tzhost::writeFileSafely(path("a"), ""));
    EXPECT_EQ(tzhost::readFile(path("a")), "");
    EXPECT_EQ(filesThere(), 1);
}

TEST_F(FileBytes, OfWhatIsNoFileAreNothing) {
    ASSERT_EQ(::mkfifo(path("pipe").c_str(), 0600), 0);
    EXPECT_FALSE(tzhost::readFile(path("pipe")));
    EXPECT_EQ(tzhost::systemReason(), "it is a device or a pipe");
    EXPECT_FALSE(tzhost::readFile(path("none")));
    EXPECT_FALSE(tzhost::systemReason().empty());
    EXPECT_FALSE(tzhost::readFile(folder_.string()));
}

// Those of another user used to become the writer's own.
TEST_F(FileBytes, KeepOwnerPermissionsAndLinks) {
    ASSERT_TRUE(tzhost::writeFileSafely(path("real"), "old"));
    uid_t const owner = ::geteuid() == 0 ? 65534 : ::geteuid();  // only root gives files away
    ASSERT_EQ(::chown(path("real").c_str(), owner, ::getegid()), 0);
    ASSERT_EQ(::chmod(path("real").c_str(), 0640), 0);
    fs::create_symlink("real", path("link"));
    ASSERT_TRUE(tzhost::writeFileSafely(path("link"), "new"));
    EXPECT_TRUE(fs::is_symlink(path("link")));
    EXPECT_EQ(tzhost::readFile(path("real")), "new");
    struct stat status {};
    ASSERT_EQ(::stat(path("real").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777U, 0640U);
    EXPECT_EQ(status.st_uid, owner);
}

// They used to put a file in the place of a link whose file was not there yet.
TEST_F(FileBytes, FollowLinksThatLeadToNoFileYet) {
    fs::create_directory(path("folder"));
    fs::create_symlink("inner", path("link"));
    fs::create_symlink("folder/real", path("inner"));
    ASSERT_TRUE(tzhost::writeFileSafely(path("link"), "new"));
    EXPECT_TRUE(fs::is_symlink(path("link")) && fs::is_symlink(path("inner")));
    EXPECT_EQ(tzhost::readFile(path("folder/real")), "new");
}

// A ring of links and a read-only file used to be replaced.
TEST_F(FileBytes, StayOldWhenTheyCannotBeWritten) {
    fs::create_directory(path("folder"));
    fs::create_symlink("b", path("a"));
    fs::create_symlink("a", path("b"));
    ASSERT_TRUE(tzhost::writeFileSafely(path("locked"), "old"));
    ASSERT_EQ(::chmod(path("locked").c_str(), 0444), 0);
    std::string const longName(300, 'n');
    for (auto const& [name, problem] : {std::pair{"no/such/file", "No such file or directory"},
                                        {"folder", "Is a directory"},
                                        {"a", "Too many levels of symbolic links"},
                                        {"locked", "it is read-only"},
                                        {longName.c_str(), "File name too long"}}) {
        EXPECT_EQ(tzhost::SafeFile(path(name)).reason(), problem) << name;
        EXPECT_FALSE(tzhost::writeFileSafely(path(name), "new")) << name;
    }
    EXPECT_TRUE(fs::is_symlink(path("a")));
    EXPECT_EQ(tzhost::readFile(path("locked")), "old");
    EXPECT_EQ(filesThere(), 4);  // no unfinished file is left
    EXPECT_TRUE(tzhost::isReadOnly(path("locked")));
    EXPECT_FALSE(tzhost::isReadOnly(path("folder")));
    tzhost::SafeFile asked(path("locked"), tzhost::IfReadOnly::replace);
    EXPECT_TRUE(asked.write("new") && asked.commit());
    EXPECT_EQ(tzhost::readFile(path("locked")), "new");
}

// The longest name that a file can have used to have no room for the unfinished one beside it. What
// a killed save left used to stay for ever.
TEST_F(FileBytes, LeaveNoUnfinishedFileButThatOfAnotherSave) {
    std::string const longest(255, 'n');
    for (std::string const& name : {std::string("plan.json"), longest}) {
        std::string const left = path(('.' + name.substr(0, 239) + ".tz-part-2").c_str());
        ASSERT_TRUE(tzhost::writeFileSafely(left, "unfinished"));
        tzhost::SafeFile other(path(name.c_str()));
        EXPECT_FALSE(fs::exists(left));
        EXPECT_TRUE(tzhost::writeFileSafely(path(name.c_str()), "new"));
        EXPECT_TRUE(other.write("other") && other.commit());
        EXPECT_EQ(tzhost::readFile(path(name.c_str())), "other");
    }
    EXPECT_EQ(filesThere(), 2);
}

// It used to put a file in the place of the pipe, and of a device.
TEST_F(FileBytes, GoIntoAPipeAsItIs) {
    ASSERT_EQ(::mkfifo(path("pipe").c_str(), 0600), 0);
    int const reader = ::open(path("pipe").c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    ASSERT_TRUE(tzhost::writeFileSafely(path("pipe"), "abc"));
    char bytes[8];
    EXPECT_EQ(::read(reader, bytes, sizeof bytes), 3);
    EXPECT_TRUE(fs::is_fifo(path("pipe")));
    EXPECT_EQ(filesThere(), 1);
    ::close(reader);
}

// It used to replace the file that standard output was directed to, with all that stood in it.
TEST_F(FileBytes, JoinTheProgramsOwnOutput) {
    ASSERT_TRUE(tzhost::writeFileSafely(path("log"), "before "));
    int const terminal = ::fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, 0);
    int const log = ::open(path("log").c_str(), O_WRONLY | O_APPEND | O_CLOEXEC);
    ASSERT_EQ(::dup2(log, STDOUT_FILENO), STDOUT_FILENO);
    bool const isWritten = tzhost::writeFileSafely("/dev/stdout", "new");
    bool const isGoingOn = ::write(STDOUT_FILENO, " behind", 7) == 7;
    ASSERT_EQ(::dup2(terminal, STDOUT_FILENO), STDOUT_FILENO);
    ::close(log);
    ::close(terminal);
    EXPECT_TRUE(isWritten && isGoingOn);
    EXPECT_EQ(tzhost::readFile(path("log")), "before new behind");
}

volatile std::sig_atomic_t ended = 0;

// Together they take their places, each that can; a signal that ends the program waits for them.
TEST_F(FileBytes, TakeTheirPlacesTogether) {
    auto const before = std::signal(SIGTERM, [](int) { ended = 1; });
    ASSERT_TRUE(tzhost::writeFileSafely(path("old"), "old"));
    {
        tzhost::SafeFiles files;
        EXPECT_EQ(files.add(path("none") + "/x", "x"), "No such file or directory");
        EXPECT_EQ(files.add(path("old"), "new"), "");
        EXPECT_EQ(files.add(path("taken"), "x"), "");
        EXPECT_EQ(files.add(path("made"), "made"), "");
        fs::create_directories(path("taken") + "/below");
        std::raise(SIGTERM);
        EXPECT_EQ(tzhost::readFile(path("old")), "old");
        EXPECT_EQ(ended, 0);
        EXPECT_EQ(files.takePlaces(), (std::vector<std::string>{"", "Is a directory", ""}));
        EXPECT_EQ(ended, 1);
        EXPECT_EQ(files.add(path("made"), "given up"), "");
    }
    EXPECT_EQ(tzhost::readFile(path("old")), "new");
    EXPECT_EQ(tzhost::readFile(path("made")), "made");
    EXPECT_EQ(filesThere(), 3);
    std::signal(SIGTERM, before);
}

TEST(InstallPaths, LeadToTheLibraries) {
    EXPECT_TRUE(fs::exists(fs::path(tzhost::libraryFolder()) / "libtz.so.1"));
}

struct FolderRow {
    char const* name;
    char const* configuration;  // XDG_CONFIG_HOME; null for none
    char const* home;
    char const* folder;
};
// A relative folder used to be looked for in the working folder, where a stranger's settings chose
// the editor.
constexpr FolderRow kFolders[] = {
    {"Given", "/x", "/h", "/x/tzdraft"},
    {"Home", nullptr, "/h", "/h/.config/tzdraft"},
    {"Relative", "x", "/h", "/h/.config/tzdraft"},
    {"NoHome", nullptr, nullptr, ""},
    {"RelativeHome", "", ".", ""},
};
class ConfigurationFolder : public testing::TestWithParam<FolderRow> {};
TEST_P(ConfigurationFolder, IsNeverRelative) {
    auto const set = [](char const* name, char const* value) {
        value ? setenv(name, value, 1) : unsetenv(name);
    };
    char const* const given = getenv("XDG_CONFIG_HOME");
    std::string const home = getenv("HOME") ? getenv("HOME") : "";
    std::string const before = given ? given : "";
    set("XDG_CONFIG_HOME", GetParam().configuration);
    set("HOME", GetParam().home);
    EXPECT_EQ(tzhost::configurationFolder(), GetParam().folder);
    setenv("XDG_CONFIG_HOME", before.c_str(), 1);
    setenv("HOME", home.c_str(), 1);
}
INSTANTIATE_TEST_SUITE_P(Rows,
                         ConfigurationFolder,
                         testing::ValuesIn(kFolders),
                         [](auto const& row) { return row.param.name; });

}  // namespace
