// Whole files: what a safe write leaves behind when it works and when it does not.

#include <gtest/gtest.h>

#include <cstddef>
#include <filesystem>
#include <string>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"

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
    EXPECT_FALSE(tzhost::readFile(path("none")));
    EXPECT_FALSE(tzhost::systemReason().empty());
    EXPECT_FALSE(tzhost::readFile(folder_.string()));
}

TEST_F(FileBytes, KeepPermissionsAndLinks) {
    ASSERT_TRUE(tzhost::writeFileSafely(path("real"), "old"));
    ASSERT_EQ(::chmod(path("real").c_str(), 0640), 0);
    fs::create_symlink("real", path("link"));
    ASSERT_TRUE(tzhost::writeFileSafely(path("link"), "new"));
    EXPECT_TRUE(fs::is_symlink(path("link")));
    EXPECT_EQ(tzhost::readFile(path("real")), "new");
    struct stat status {};
    ASSERT_EQ(::stat(path("real").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777U, 0640U);
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

TEST_F(FileBytes, StayOldWhenTheyCannotBeWritten) {
    EXPECT_FALSE(tzhost::writeFileSafely(path("no/such/file"), "new"));
    fs::create_directory(path("folder"));
    EXPECT_FALSE(tzhost::writeFileSafely(path("folder"), "new"));
    EXPECT_TRUE(fs::is_directory(path("folder")));
    EXPECT_EQ(filesThere(), 1);  // no temporary file is left
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

TEST(InstallPaths, LeadToTheLibraries) {
    EXPECT_TRUE(fs::exists(fs::path(tzhost::libraryFolder()) / "libtz.so.1"));
}

}  // namespace
