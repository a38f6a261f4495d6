#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "apps/tzdraft/draft_program.h"

namespace {

namespace fs = std::filesystem;

struct TranscriptCase {
    char const* name;
    char const* script;
    char const* expected;  // a part of what is shown
    int status = tzdraft::kDone;
};

TranscriptCase const kCases[] = {
    {"HelpOnOne", "HELP\nU\n", "Takes the last command back; it asks nothing.\n"},
    {"HelpOnAModulesCommand", "HELP\n_mtext\n", "Writes a multi-line text between two corners, in"},
    {"HelpOnWhatIsGone", "UNLOAD\nHELP\n_mtext\n", "There is no help on \"_mtext\"."},
    {"ControlCharactersShow", "TEXT\n0,0\n\n\n\x1B[6n\xC2\x9B\nLIST\nlast\n\n",
     "text             \\U+001B[6n\\U+009B\n"},
    // It used to be 57.2958, which the answer 1 is not.
    {"AnglesAsTheyAreRead", "SETVAR\nAUNITS\n3\nSTYLE\n\n\n\n\n1\n\n\n\n\nSTYLE\n\n\n\n\n^C\n",
     "Obliquing angle <1.0000r>: "},
    {"HelpOnNothing", "HELP\nDANCE\n", "There is no help on \"DANCE\".\n"},
    {"HelpLists", "HELP\n\n", "CIRCLE           Draws a circle from its center and radius.\n"},
    {"ListTells", "CIRCLE\n1,2\n3\nLIST\nlast\n\n",
     "Circle  #1, layer \"0\"\n  center           1.0000, 2"},
    {"SelectedIsListed", "CIRCLE\n0,0\n1\nSELECT\nlast\n\nLIST\n", "Command: LIST\nCircle  #1"},
    {"SelectedIsForOneCommand", "CIRCLE\n0,0\n1\nSELECT\nlast\n\nLIST\nLIST\n^C\n",
     "Command: LIST\nSelect objects: ^C"},
    {"NothingToTakeBack", "U\n", "There is nothing to take back.\n"},
    {"NoModuleLeft", "UNLOAD\nUNLOAD\n", "Command: UNLOAD\nNo module is loaded.\n"},
    {"NamesForRecords", "LAYER\nM\n lead\n\n",
     "\" lead\" cannot be the name of a layer. A name has up to 255 letters, none of < >"},
    // The style of the file used to be current while the variable said "Standard".
    {"OpenedStyleIsShown",
     "STYLE\nBig\n\n\n\n\n\n\n\n\n"
     "SAVE\nbig.json\nNEW\nOPEN\nbig.json\nSETVAR\nTEXTSTYLE\n\n",
     "TEXTSTYLE is read-only: Big\n"},
    {"GoneWithItsModule", "UNLOAD\nMTEXT\n",
     "no command \"MTEXT\". Near it is TEXT. HELP lists all.\n"},
    {"ListTellsAll",
     "ATTDEF\n\nNO\n\n17\n0,0\n1\n\nBLOCK\nDOOR\n0,0\nall\n\nINSERT\nDOOR\n5,0\n2\n30\n18\n"
     "-MTEXT\n0,0\nColumns\nStatic\n20\n2\n1\n10\nOne\n\nLIST\nall\n\n",
     "  block            DOOR\n  position         5.0000, 0.0000, 0.0000\n  scale            2\n"
     "  rotation         30\n  NO               18\nMText  #5, layer \"0\"\n"
     "  location         0.0000, 0.0000, 0.0000\n  attachment       top left\n"
     "  style            Standard\n  text height      1.0000\n  rotation         0\n"
     "  line spacing     at least 1\n"},
    // They used to be 0 columns.
    {"ListTellsDynamicColumns", "-MTEXT\n0,0\nColumns\nDynamic\n20\n1\n10\nOne\n\nLIST\nall\n\n",
     "  columns          dynamic, width 20.0000, gutter 1.0000\n"},
    {"ListTellsWhatATextIsMarkedWith",
     "STYLE\nNote\n\n\n\n\n\n\n\nYes\n-MTEXT\n0,0\n9,9\nOne\n\nSETVAR\nMTEXTED\nOLDEDITOR\nMTEDIT\n"
     "#1\n<<<\nbackground={\"fill\": true, \"color\": 2, \"transparency\": 50}\n>>>\nLIST\nall\n\n",
     "  background       colour 2, scale 1.5, transparency 50\n  annotative       yes\n"
     "  contents         One\n"},
    {"NothingNear", "WALTZ\n", "There is no command \"WALTZ\". HELP lists all.\n"},
    {"UndoSaysWhat", "CIRCLE\n0,0\n1\nundo\nREDO\nexit\n",
     "CIRCLE is taken back.\nCommand: REDO\nCIRCLE is done again.\nCommand: exit\n"},
    // It used to be a step of its own, since the field was another.
    {"FieldSetAnewIsNoChange",
     "-MTEXT\n0,0\n9,9\n%<\\Var LUNITS>%\n\nSETVAR\nMTEXTED\nOLDEDITOR\nMTEDIT\n#1\n<<<\n"
     "textHeight=0.2\n>>>\nU\n",
     "-MTEXT is taken back.\n"},
    {"NothingToDoAgain", "REDO\n", "There is nothing to do again.\n"},
    {"BlocksAndStylesAreListed", "INSERT\n?\n\nSTYLE\n?\nNew\nNo Such Face\n^C\n",
     "none yet.\nBlock to insert or [?]: \nCommand: STYLE\nText style name or [?] <Standard>: ?\n"
     "  Standard\nText style name or [?] <Standard>: New\nFont file or typeface <txt.shx>: "
     "No Such Face\nThe typeface \"No Such Face\" is not installed; another stands in for it.\n"},
    {"LoadedTwice", "LOAD\n\n", "tzmted.tzx: this module is loaded already\n", tzdraft::kFailed},
    {"NoSuchModule", "LOAD\nmissing.tzx\n",
     "missing.tzx: the module cannot be loaded: ", tzdraft::kFailed},
    {"EnterRepeatsNothingInAScript", "U\n\nHELP\nU\n", "back.\nCommand: \nCommand: HELP\n"},
};

class Transcripts : public testing::TestWithParam<TranscriptCase> {};

TEST_P(Transcripts, Show) {
    tzdraft::Options options;
    fs::path const folder(testing::TempDir());
    options.script = (folder / "transcript.scr").string();
    options.settings = folder / "transcript-settings.json";
    options.module = fs::path(std::getenv("TZ_TEST_LIB")) / "tzmted.tzx";
    std::ofstream(options.script) << GetParam().script;
    std::ofstream(options.settings) << "{}";
    std::string seen;
    auto const note = [&](std::string_view text) { seen += text; };
    EXPECT_EQ(GetParam().status, tzdraft::runProgram(options, {note, note}));
    EXPECT_NE(std::string::npos, seen.find(GetParam().expected)) << seen;
}

INSTANTIATE_TEST_SUITE_P(Scripts, Transcripts, testing::ValuesIn(kCases), [](auto const& row) {
    return row.param.name;
});

}  // namespace
