#include <gtest/gtest.h>

#include "host/database/symbol_imp.h"
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
    char const* text;   // members of a drawing after format and version
    char const* found;  // in the saved drawing
};

constexpr KeptCase kKept[] = {
    {"Contents", R"("entities":[{"type":"MTEXT","contents":"a\"\\P\u00e9\ud834\udd1e\n\u0001"}])",
     "\"contents\":\"a\\\"\\\\P\u00e9\U0001D11E\\n\\u0001\""},
    {"Doubles",
     R"("entities":[{"type":"LINE","start":[0.1,1e22,-0.0],)"
     R"("end":[5e-324,1.7976931348623157e308,3.0]}])",
     R"("start":[0.1,1e+22,0],"end":[5e-324,1.7976931348623157e+308,3])"},
    {"SlantedDirection", R"("entities":[{"type":"MTEXT","direction":[0,5,7]}])",
     R"("direction":[0,1,0])"},
    // Each save used to change the last digits of the direction.
    {"DirectionNearNormal",
     R"("entities":[{"type":"MTEXT","normal":[0.6,0,0.8],"direction":[0.60001,0.3e-5,0.8]}])",
     R"("type":"MTEXT")"},
    {"SkewNormal", R"("entities":[{"type":"CIRCLE","normal":[1,2,3],"center":[1,2,3]}])",
     R"("center":[1,2,3],"normal":[0.26)"},
    {"Columns",
     R"("entities":[{"type":"MTEXT","columns":{"type":2,"heights":[3,4],"flowReversed":true}}])",
     R"("columns":{"type":2,"autoHeight":false,"count":0,"width":0,"gutter":0,"heights":[3,4],)"
     R"("flowReversed":true})"},
    {"Background", R"("entities":[{"type":"MTEXT","background":{"fill":true,"color":"#0a0B0c"}}])",
     R"("background":{"fill":true,"color":"#0A0B0C","scale":1.5,"useBackgroundColor":false,)"
     R"("transparency":0})"},
    {"Justified",
     R"("entities":[{"type":"TEXT","justification":"TR","alignment":[3,4,0],"textHeight":2}])",
     R"("position":[3,2,0],"justification":"TR","alignment":[3,4,0])"},
    {"JustifiedAtItsPosition",
     R"("entities":[{"type":"TEXT","position":[1,2,3],"justification":"BL"}])",
     R"("position":[1,2,3],"justification":"BL","alignment":[1,2,3])"},
    {"JustifiedUpsideDown",
     R"("textStyles":[{"name":"s","upsideDown":true}],"entities":[)"
     R"({"type":"TEXT","style":"s","justification":"TL","textHeight":1}])",
     R"("position":[0,1,0],"justification":"TL")"},
    {"JustifiedDownwards",
     R"("textStyles":[{"name":"s","vertical":true}],"entities":[)"
     R"({"type":"TEXT","style":"s","justification":"Right","textHeight":1,"text":"AB"}])",
     R"("position":[0,2.5,0],"justification":"Right")"},
    {"Page", R"("page":{"paper":"legal","scale":[0.5,1e3],"tray":2})",
     R"("page":{"paper":"legal","landscape":true,"margin":10,"scale":[0.5,1000],"unit":"mm",)"
     R"("window":null,"tray":2})"},
    {"PaperSpace", R"("entities":[{"type":"LINE","space":"paper"},{"type":"CIRCLE"}])",
     R"({"handle":"1","type":"LINE","space":"paper")"},
    {"HandlesToTheLast",
     R"("entities":[{"handle":"3FFFFFFFFFFFFFFF","type":"LINE"},{"handle":"1","type":"LINE"},)"
     R"({"type":"CIRCLE"}])",
     R"({"handle":"2","type":"CIRCLE")"},
    {"UnmeasuredLine", R"("entities":[{"type":"TEXT","textHeight":1e308,"text":"hello"}])",
     R"("inWorkingSet":true}])"},
    {"UnmeasuredColumns",
     R"("entities":[{"type":"MTEXT","contents":"a","columns":{"type":1,"count":1000,)"
     R"("width":1e306}}])",
     R"("inWorkingSet":true}])"},
    {"NameOfAMark", R"("entities read":1,"entities":[{"type":"LINE"}])", R"("type":"LINE")"},
    // "Continuous" and "Standard" used to come first.
    {"TableOrder", R"("linetypes":[{"name":"Dashed"},{"name":"continuous"}])",
     "[\n  {\"name\":\"Dashed\",\"dashes\":[]},\n  {\"name\":\"continuous\""},
    {"LackingRecordIsLast", R"("textStyles":[{"name":"Notes"}])",
     "\"paperOrientation\":false},\n  {\"name\":\"Standard\""},
    {"Handles", R"("entities":[{"type":"LINE"},{"handle":"ff","type":"CIRCLE"}])",
     R"({"handle":"100","type":"LINE")"},
    {"Field", R"("entities":[{"type":"MTEXT","contents":"old","field":"%<\\Date>%"}])",
     R"("field":"%<\\Date>%")"},
    {"FieldText", R"("entities":[{"type":"MTEXT","contents":"old","field":"%<\\Date>%"}])",
     R"("contents":"old")"},
    {"WorkingSet",
     R"("workingSet":{"exists":true,"active":true},"workingAngle":0.5,)"
     R"("entities":[{"type":"LINE","inWorkingSet":false}])",
     "\"inWorkingSet\":false}],\n \"workingSet\":{\"exists\":true,\"active\":true},\n "
     "\"workingAngle\":0.5"},
    {"Definition",
     R"("entities":[{"type":"ATTDEF","tag":"T","prompt":"P","mtext":{"contents":"c","width":3}}])",
     R"("tag":"T","prompt":"P","mtext":{"location":[0,0,0])"},
    {"Reference",
     R"("entities":[{"type":"INSERT","block":"b","attributes":[{"type":"ATTRIB","tag":"T"}]}],)"
     R"("blocks":[{"name":"B","entities":[{"type":"INSERT","block":"C"}]},{"name":"C",)"
     R"("origin":[1,2,3]}])",
     R"("block":"B","position":[0,0,0],"normal":[0,0,1],"rotation":0,"scale":1,)"
     R"("attributes":[{"handle":"2","type":"ATTRIB")"},
    {"TablesBehindEntities",
     R"("entities":[{"type":"TEXT","layer":"walls","style":"Fancy"}],)"
     R"("textStyles":[{"name":"Fancy","height":2,"backward":true}],"layers":[{"name":"Walls",)"
     R"("color":"#102030","locked":true}],"currentLayer":"WALLS","currentTextStyle":"fancy")",
     R"("layer":"Walls","color":256)"},
    {"LayersKeepTheirOrder", R"("layers":[{"name":"b"},{"name":"a"}])",
     "{\"name\":\"b\",\"color\":7,\"locked\":false,\"off\":false},\n  {\"name\":\"a\""},
    {"Linetypes", R"("linetypes":[{"name":"Dashed","dashes":[1,-0.5]}])", R"("dashes":[1,-0.5])"},
    {"Systems", R"("ucs":{"origin":[1,2,3],"x":[0,1,0],"y":[0,0,1]})",
     R"("ucs":{"origin":[1,2,3],"x":[0,1,0],"y":[0,0,1]})"},
    {"Variables", R"("variables":{"TEXTSIZE":2.5,"TEXTLAYER":"A","LASTPOINT":[1,2,3]})",
     R"("LASTPOINT":[1,2,3])"},
    {"UnknownOfTheDrawing", R"("unheardOf":{"a":[1,2.50,null,"x"]})",
     R"("unheardOf":{"a":[1,2.50,null,"x"]})"},
    {"UnknownVariable", R"("variables":{"NEWVAR":1})", R"("NEWVAR":1})"},
    {"UnknownOfAnEntity", R"("entities":[{"type":"LINE","weight":0.35}])", R"("weight":0.35})"},
    {"UnknownOfColumns", R"("entities":[{"type":"MTEXT","columns":{"rule":true}}])",
     R"("gutter":0,"rule":true})"},
    {"UnknownOfLines", R"("entities":[{"type":"ATTDEF","mtext":{"background":{"edge":1}}}])",
     R"("transparency":0,"edge":1})"},
    {"UnknownOfALayer", R"("layers":[{"name":"0","frozen":true}])",
     R"("locked":false,"off":false,"frozen":true})"},
    {"UnknownOfABlock", R"("blocks":[{"name":"B","author":"me"}])",
     R"("entities":[],"author":"me"})"},
};

class RoundTrips : public testing::TestWithParam<KeptCase> {};

TEST_P(RoundTrips, KeepWhatIsThere) {
    std::string const once =
        saved(std::string(R"({"format":"tz-drawing","version":1,)") + GetParam().text + "}");
    EXPECT_NE(once.find(GetParam().found), std::string::npos) << once;
    EXPECT_EQ(saved(once), once);
}

// Reading n blocks used to index the table of blocks n times.
TEST(ReadingBlocks, IndexesTheirNamesOnce) {
    unsigned int const before = tzhost::namesGeneration();
    (void)saved(
        R"({"format":"tz-drawing","version":1,"blocks":[{"name":"A"},{"name":"B"},{"name":"C"}]})");
    EXPECT_LE(tzhost::namesGeneration(), before + 1);
}

INSTANTIATE_TEST_SUITE_P(Members, RoundTrips, testing::ValuesIn(kKept), [](auto const& row) {
    return row.param.name;
});

}  // namespace
