#include <unistd.h>

#include <gtest/gtest.h>

#include "host/base/audit.h"
#include "host/drawing_file/drawing_file.h"
#include "tests/drawing_file/drawing_texts.h"

namespace {

using tzhost::test::scratch;
using tzhost::test::writeBytes;

// The text of a file, and what the line of its fault says after the file's name. A text that starts
// with a comma follows the members "format" and "version" of line 1.
struct BadCase {
    char const* name;
    std::string text;
    char const* error;
};

std::string deep(int levels) {
    return ",\"x\":" + std::string(static_cast<std::size_t>(levels), '[') +
           std::string(static_cast<std::size_t>(levels), ']') + "}";
}

BadCase const kBad[] = {
    {"Empty", "",
     ":1: the drawing is no JSON here: unexpected end of input; expected '[', '{', or a literal"},
    {"Array", "[]", ":1: the drawing is an array, expected an object"},
    {"Cut", ",\n\"layers\":[{\"name\":\"A\"",
     ":2: member \"name\": is no JSON here: unexpected end of input; expected '}'"},
    {"BehindTheEnd", "}\n{}",
     ":2: member \"version\": is no JSON here: unexpected '{'; expected end of input"},
    {"NoFormat", "{\"version\":1}", ":1: member \"format\": is missing, expected \"tz-drawing\""},
    {"OtherFormat", "{\"format\":\"dwg\",\"version\":1}",
     ":1: member \"format\": is another, expected \"tz-drawing\""},
    {"Newer", "{\"format\":\"tz-drawing\",\n\"version\":2}",
     ":2: member \"version\": is 2 and newer than this program, expected 1"},
    {"VersionText", "{\"format\":\"tz-drawing\",\"version\":\"1\"}",
     ":1: member \"version\": is no version, expected 1"},
    {"NotUtf8", ",\n\"currentLayer\":\"\xFF\"}",
     ":2: member \"currentLayer\": is not UTF-8, expected UTF-8 text"},
    {"HalfCharacter", ",\"entities\":[{\"type\":\"MTEXT\",\n\"contents\":\"\xC3\"}]}",
     ":2: member \"contents\": is not UTF-8, expected UTF-8 text"},
    {"TooLarge", ",\"entities\":[{\"type\":\"MTEXT\",\n\n\"width\":1e999}]}",
     ":3: member \"width\": is too large a number, expected one below 1.8e308"},
    {"TooLargeUnknown", ",\"unheardOf\":-1e400}",
     ":1: member \"unheardOf\": is too large a number, expected one below 1.8e308"},
    // The fast parser lets half a pair through, and refuses this zero.
    {"HalfPair", ",\"entities\":[{\"type\":\"MTEXT\",\n\"contents\":\"\\udc00\"}]}",
     ":2: member \"contents\": is no JSON here: invalid string: surrogate U+DC00..U+DFFF must "
     "follow U+D800..U+DBFF"},
    {"HugeZero", ",\n\"unheardOf\":0e400,\n\"layers\":3}",
     ":3: member \"layers\": is a number, expected an array"},
    {"LineEndBeforeTheEnd", ",\n\"unheardOf\":1\n",
     ":2: member \"unheardOf\": is no JSON here: unexpected end of input; expected '}'"},
    {"Twice", ",\n\"currentLayer\":\"0\",\n\"currentLayer\":\"0\"}",
     ":3: member \"currentLayer\": stands twice, expected each member once"},
    {"TwiceInside", ",\"entities\":[{\"type\":\"LINE\",\"start\":[0,0,0],\n\"start\":[0,0,0]}]}",
     ":2: member \"start\": stands twice, expected each member once"},
    {"TooDeep", deep(201), ":1: member \"x\": is nested too deeply, expected at most 200 levels"},
    {"EntitiesNumber", ",\"entities\":3}",
     ":1: member \"entities\": is a number, expected an array"},
    {"EntitiesObject", ",\"entities\":{}}",
     ":1: member \"entities\": is an object, expected an array"},
    {"EntityNumber", ",\"entities\":[\n3]}",
     ":2: member \"entities\": holds a number, expected an object"},
    {"LayersObject", ",\"layers\":{}}", ":1: member \"layers\": is an object, expected an array"},
    {"BlockText", ",\"blocks\":[\"A\"]}",
     ":1: member \"blocks\": holds a text, expected an object"},
    {"NoType", ",\"entities\":[{}]}",
     ":1: member \"type\": is missing, expected MTEXT, TEXT, ATTDEF, LINE, CIRCLE or INSERT"},
    {"OtherType", ",\"entities\":[{\"type\":\"ARC\"}]}",
     ":1: member \"type\": is \"ARC\", expected MTEXT, TEXT, ATTDEF, LINE, CIRCLE or INSERT"},
    {"WrongType", ",\"entities\":[{\"type\":\"MTEXT\",\n\"textHeight\":\"big\"}]}",
     ":2: member \"textHeight\": is a text, expected a number above 0"},
    {"OutOfRange", ",\"entities\":[{\"type\":\"MTEXT\",\"textHeight\":0}]}",
     ":1: member \"textHeight\": is 0, expected a number above 0"},
    {"NoWholeNumber", ",\"entities\":[{\"type\":\"MTEXT\",\"attachment\":1.5}]}",
     ":1: member \"attachment\": is 1.5, expected a whole number from 1 to 9"},
    {"Nested", ",\"entities\":[{\"type\":\"MTEXT\",\"columns\":{\"count\":1,\n\"width\":-1}}]}",
     ":2: member \"columns.width\": is -1, expected a number, 0 or more"},
    {"NestedKind", ",\"entities\":[{\"type\":\"MTEXT\",\"background\":[]}]}",
     ":1: member \"background\": is an array, expected an object"},
    {"Transparency", ",\"entities\":[{\"type\":\"MTEXT\",\"background\":{\"transparency\":91}}]}",
     ":1: member \"background.transparency\": is 91, expected a whole number from 0 to 90"},
    {"Color", ",\"entities\":[{\"type\":\"LINE\",\"color\":\"#12345G\"}]}",
     ":1: member \"color\": is a text,"
     " expected a whole number from 0 to 256 or a text \"#RRGGBB\""},
    {"PointOfTwo", ",\"entities\":[{\"type\":\"LINE\",\"end\":[1,2]}]}",
     ":1: member \"end\": is an array, expected an array of three numbers"},
    {"PointOfTexts", ",\"entities\":[{\"type\":\"LINE\",\"end\":[1,2,\"3\"]}]}",
     ":1: member \"end\": holds a text, expected an array of three numbers"},
    {"ZeroNormal", ",\"entities\":[{\"type\":\"CIRCLE\",\"normal\":[0,0,0]}]}",
     ":1: member \"normal\": is zero, expected a direction"},
    {"Parallel", ",\"entities\":[{\"type\":\"MTEXT\",\"direction\":[0,0,-3]}]}",
     ":1: member \"direction\": is parallel to the normal, expected another direction"},
    {"ZeroCharacter", ",\"entities\":[{\"type\":\"MTEXT\",\"contents\":\"a\\u0000b\"}]}",
     ":1: member \"contents\": holds a zero character, expected a text without one"},
    {"HandleTwice",
     ",\"entities\":[{\"handle\":\"2A\",\"type\":\"LINE\"}"
     ",\n{\"handle\":\"2a\",\"type\":\"LINE\"}]}",
     ":2: member \"handle\": is \"2a\" as that of an earlier entity, expected each handle once"},
    {"HandleZero", ",\"entities\":[{\"handle\":\"0\",\"type\":\"LINE\"}]}",
     ":1: member \"handle\": is no handle, expected a text of hexadecimal digits from \"1\" to "
     "\"3FFFFFFFFFFFFFFF\""},
    {"HandleNumber", ",\"entities\":[{\"handle\":42,\"type\":\"LINE\"}]}",
     ":1: member \"handle\": is no handle, expected a text of hexadecimal digits from \"1\" to "
     "\"3FFFFFFFFFFFFFFF\""},
    {"Space", ",\"entities\":[{\"type\":\"LINE\",\"space\":\"outer\"}]}",
     ":1: member \"space\": is no space, expected \"model\" or \"paper\""},
    {"Justification", ",\"entities\":[{\"type\":\"TEXT\",\"justification\":\"top\"}]}",
     ":1: member \"justification\": is no justification, expected Left, Center, Right, TL, TC, TR, "
     "ML, MC, MR, BL, BC or BR"},
    {"UnknownLayer", ",\"entities\":[{\"type\":\"LINE\",\n\"layer\":\"Walls\"}]}",
     ":2: member \"layer\": names \"Walls\", expected the name of a layer of this drawing"},
    {"UnknownStyle", ",\"entities\":[{\"type\":\"TEXT\",\"style\":\"Fancy\"}]}",
     ":1: member \"style\": names \"Fancy\", expected the name of a text style of this drawing"},
    {"UnknownBlock", ",\"entities\":[{\"type\":\"INSERT\",\n\"block\":\"DOOR\"}]}",
     ":2: member \"block\": names \"DOOR\", expected the name of a block of this drawing"},
    {"UnknownCurrent", ",\n\"currentTextStyle\":\"Fancy\"}",
     ":2: member \"currentTextStyle\": names \"Fancy\", expected a name that the drawing has"},
    {"BlockInItself",
     ",\"blocks\":[{\"name\":\"A\",\"entities\":[{\"type\":\"INSERT\",\"block\":\"B\"}]},\n"
     "{\"name\":\"B\",\"entities\":[{\"type\":\"INSERT\",\"block\":\"A\"}]}]}",
     ":2: member \"block\": leads back to the block that holds it, expected another"},
    {"BlockTwice", ",\"blocks\":[{\"name\":\"A\"},\n{\"name\":\"a\"}]}",
     ":2: member \"name\": stands twice, expected each once"},
    {"BlockWithoutName", ",\"blocks\":[{}]}",
     ":1: member \"name\": is missing or empty, expected a name"},
    {"LayerTwice", ",\"layers\":[{\"name\":\"A\"},\n{\"name\":\"a\"}]}",
     ":2: member \"name\": stands twice, expected each once"},
    {"LayerColor", ",\"layers\":[{\"name\":\"A\",\"color\":256}]}",
     ":1: member \"color\": is 256, expected a whole number from 1 to 255 or a text \"#RRGGBB\""},
    {"Attribute",
     ",\"blocks\":[{\"name\":\"A\"}],\"entities\":[{\"type\":\"INSERT\",\"block\":\"A\","
     "\"attributes\":[{\"type\":\"TEXT\"}]}]}",
     ":1: member \"type\": is missing or another, expected ATTRIB"},
    {"VariableType", ",\"variables\":{\"LUNITS\":2,\n\"LUPREC\":\"4\"}}",
     ":2: member \"variables.LUPREC\": is a text, expected a whole number"},
    {"VariableRange", ",\"variables\":{\"LUNITS\":9}}",
     ":1: member \"variables.LUNITS\": is outside its limits, expected a whole number from 1 to 5"},
    {"VariableTwice", ",\"variables\":{\"TEXTSIZE\":3,\n\"textsize\":4}}",
     ":2: member \"variables.textsize\": stands twice, expected each member once"},
    {"SlantedSystem", ",\"ucs\":{\"x\":[1,0,0],\"y\":[1,1,0]}}",
     ":1: member \"ucs.y\": stands at no right angle to x, expected one that does"},
    {"WorkingAngle", ",\"workingAngle\":\"0\"}",
     ":1: member \"workingAngle\": is a text, expected a number"},
    {"PageText", ",\n\"page\":\"A3\"}", ":2: member \"page\": is a text, expected an object"},
    {"PagePaper", ",\"page\":{\n\"paper\":\"B5\"}}",
     ":2: member \"page.paper\": is not what it takes, expected A0 to A4, letter, legal, tabloid, or "
     "WxH with sides of 1 to 5000 millimetres"},
    {"PageScale", ",\"page\":{\"scale\":[1,0]}}",
     ":1: member \"page.scale\": is not what it takes, expected null or two numbers above 0"},
    {"PageWindow", ",\"page\":{\"window\":[[0,0],[0,5]]}}",
     ":1: member \"page.window\": is not what it takes, expected null or two opposite corners, "
     "[[x,y],[x,y]]"},
    {"PageMargin", ",\"page\":{\"margin\":105}}",
     ":1: member \"page.margin\": the margins leave nothing of the paper"},
};

class Malformed : public testing::TestWithParam<BadCase> {};

TEST_P(Malformed, IsSaidInOneLine) {
    auto const file = scratch("bad.json");
    std::string text = GetParam().text;
    bool const isWhole = text.empty() || text[0] == '{' || text[0] == '[';
    if (!isWhole) text = "{\"format\":\"tz-drawing\",\"version\":1" + text;
    writeBytes(file, text);
    tzhost::DrawingRead const read = tzhost::readDrawing(file);
    EXPECT_EQ(read.drawing, nullptr);
    EXPECT_EQ(read.error, file.string() + GetParam().error);
    EXPECT_EQ(read.isNewer, GetParam().name == std::string("Newer"));
    EXPECT_TRUE(tzhost::audit().clean());
}

INSTANTIATE_TEST_SUITE_P(Files, Malformed, testing::ValuesIn(kBad), [](auto const& row) {
    return row.param.name;
});

TEST(DrawingFiles, MissingFileAndFolderAreSaid) {
    EXPECT_EQ(tzhost::readDrawing(scratch("none.json")).error,
              scratch("none.json").string() + ": cannot be read: No such file or directory");
    EXPECT_EQ(tzhost::readDrawing(std::filesystem::current_path()).error,
              std::filesystem::current_path().string() + ": cannot be read: Is a directory");
}

// Opening a pipe used to wait until somebody wrote into it.
TEST(DrawingFiles, AreNoPipesAndNoDevices) {
    auto const pipe = scratch("pipe.json");
    std::filesystem::remove(pipe);
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    for (std::string const& name : {pipe.string(), std::string("/dev/zero")})
        EXPECT_EQ(tzhost::readDrawing(name).error,
                  name + ": cannot be read: it is a device or a pipe");
}

TEST(DrawingFiles, VariablesOfTheUserAreLeftOut) {
    auto const file = scratch("user.json");
    writeBytes(file,
               "{\"format\":\"tz-drawing\",\"version\":1,\"variables\":{\n\"MTEXTED\":\"evil\",\n"
               "\"TEXTSIZE\":3,\n\"TEXTSTYLE\":\"A\"}}");
    tzhost::DrawingRead const read = tzhost::readDrawing(file);
    ASSERT_TRUE(read.drawing) << read.error;
    ASSERT_EQ(read.warnings.size(), 2U);
    EXPECT_EQ(read.warnings[0], file.string() + ":2: member \"variables.MTEXTED\": a drawing does "
                                                "not decide it, left out");
    EXPECT_EQ(read.warnings[1], file.string() + ":4: member \"variables.TEXTSTYLE\": "
                                                "currentTextStyle has it, left out");
    ASSERT_EQ(read.variables.size(), 1U);
    EXPECT_EQ(read.variables[0].first, L"TEXTSIZE");
}

}  // namespace
