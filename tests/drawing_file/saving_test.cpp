#include <csignal>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include "host/base/fault_point.h"
#include "host/drawing_file/drawing_file.h"
#include "tests/drawing_file/drawing_texts.h"

namespace {

using tzhost::test::bytesOf;
using tzhost::test::scratch;
using tzhost::test::writeBytes;

// How many files a folder holds.
std::ptrdiff_t filesIn(std::filesystem::path const& folder) {
    return std::distance(std::filesystem::directory_iterator(folder), {});
}

class Saving : public testing::Test {
protected:
    Saving() {
        std::filesystem::remove_all(folder_);
        std::filesystem::create_directories(folder_);
        writeBytes(file_, "old");
    }

    std::filesystem::path const folder_ = scratch("saving");
    std::filesystem::path const file_ = folder_ / "plan.json";
    std::unique_ptr<tzhost::Drawing> const drawing_ = tzhost::Drawing::create();
};

TEST_F(Saving, KeepsPermissionsAndFollowsLinks) {
    ASSERT_EQ(chmod(file_.c_str(), 0640), 0);
    auto const link = folder_ / "link.json";
    std::filesystem::create_symlink(file_, link);
    EXPECT_EQ(tzhost::writeDrawing(*drawing_, link), "");
    EXPECT_TRUE(std::filesystem::is_symlink(link));
    EXPECT_EQ(bytesOf(file_).substr(0, 22), "{\"format\":\"tz-drawing\"");
    struct stat info {};
    ASSERT_EQ(stat(file_.c_str(), &info), 0);
    EXPECT_EQ(info.st_mode & 0777U, 0640U);
    EXPECT_EQ(filesIn(folder_), 2);
}

TEST_F(Saving, FileSizeLimitLeavesTheOldFile) {
    rlimit before{};
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &before), 0);
    rlimit small = before;
    small.rlim_cur = 100;
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &small), 0);
    std::string const error = tzhost::writeDrawing(*drawing_, file_);
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &before), 0);
    EXPECT_EQ(error, file_.string() + ": cannot be written: File too large");
    EXPECT_EQ(bytesOf(file_), "old");
    EXPECT_EQ(filesIn(folder_), 1);
}

TEST_F(Saving, FailuresAreSaid) {
    EXPECT_EQ(tzhost::writeDrawing(*drawing_, folder_ / "none" / "plan.json"),
              (folder_ / "none" / "plan.json").string() +
                  ": cannot be written: No such file or directory");
    EXPECT_EQ(tzhost::writeDrawing(*drawing_, folder_),
              folder_.string() + ": cannot be written: Is a directory");
    auto* const before = tzhost::setFaultHook(
        [](std::string_view operation, int&) { return operation == "writeDrawing"; });
    EXPECT_EQ(tzhost::writeDrawing(*drawing_, file_), file_.string() + ": cannot be written");
    tzhost::setFaultHook(before);
    EXPECT_EQ(bytesOf(file_), "old");
}

// A drawing with texts enough that a save takes some milliseconds.
std::string textsFor(int count) {
    std::string text = "{\"format\": \"tz-drawing\", \"version\": 1, \"layers\": [],\n"
                       "\"textStyles\": [], \"entities\": [";
    for (int i = 0; i < count; ++i) {
        text += i > 0 ? ",\n" : "\n";
        text += "{\"type\": \"MTEXT\", \"contents\": \"Note " + std::to_string(i) + "\"}";
    }
    return text + "]}\n";
}

TEST_F(Saving, KilledAtAnyMomentLeavesAWholeFile) {
    writeBytes(file_, textsFor(300));
    auto const read = tzhost::readDrawing(file_);
    ASSERT_TRUE(read.drawing) << read.error;
    ASSERT_EQ(tzhost::writeDrawing(*read.drawing, file_), "");  // measures the texts too
    std::string const whole = bytesOf(file_);
    for (int kills = 0; kills < 30; ++kills) {
        writeBytes(file_, "old");
        pid_t const child = fork();
        if (child == 0) {
            (void)tzhost::writeDrawing(*read.drawing, file_);
            _exit(0);
        }
        usleep(static_cast<useconds_t>(kills * 300));
        kill(child, SIGKILL);
        waitpid(child, nullptr, 0);
        std::string const left = bytesOf(file_);
        EXPECT_TRUE(left == "old" || left == whole) << left.substr(0, 200);
    }
    EXPECT_EQ(tzhost::writeDrawing(*read.drawing, file_), "");
    EXPECT_TRUE(bytesOf(file_) == whole);
    EXPECT_EQ(filesIn(folder_), 1);  // the killed saves' files used to stay
}

}  // namespace
