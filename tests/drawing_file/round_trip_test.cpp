#include <filesystem>
#include <fstream>
#include <sstream>

#include <gtest/gtest.h>

#include "host/drawing_file/drawing_file.h"
#include "tests/drawing_file/drawing_texts.h"

namespace {

using tzhost::test::bytesOf;
using tzhost::test::scratch;
using tzhost::test::writeBytes;

// Reads a drawing, saves it and gives the bytes.
std::string saved(std::string const& text) {
    auto const file = scratch("round.json");
    writeBytes(file, text);
    tzhost::DrawingRead read = tzhost::readDrawing(file);
    EXPECT_EQ(read.error, "");
    if (!read.drawing) return {};
    tzhost::setKeptVariables(read.variables);
    EXPECT_EQ(tzhost::writeDrawing(*read.drawing, file), "");
    return bytesOf(file);
}

struct KeptCase {
    char const* name;
    char const* text;   // members of a drawing behind format and version
    char const* found;  // in the saved drawing
};

constexpr KeptCase kKept[] = {
    {"Contents", R"("entities":[{"type":"MTEXT","contents":"a\"\\P\u00e9\ud834\udd1e"}])",
     "\"contents\":\"a\\\"\\\\P\u00e9\U0001D11E\""},
};

class RoundTrips : public testing::TestWithParam<KeptCase> {};

TEST_P(RoundTrips, KeepWhatIsThere) {
    std::string const once =
        saved(std::string(R"({"format":"tz-drawing","version":1,)") + GetParam().text + "}");
    EXPECT_NE(once.find(GetParam().found), std::string::npos) << once;
    EXPECT_EQ(saved(once), once);
}

INSTANTIATE_TEST_SUITE_P(Members, RoundTrips, testing::ValuesIn(kKept), [](auto const& row) {
    return row.param.name;
});

}  // namespace
