#pragma once

// The ids of all texts of the module. The tables of the languages in resources/ hold the same ids:
// a test compares them whole.
//
//   tzutPrintf(gStringTable[kText.noStyleFound]);
//
// The struct holds nothing but ids, so that it can also be read as an array of them.
struct TextIds {
    // Local names of the commands.
    unsigned int textalignCommand = 127;
    unsigned int mteditCommand = 143;
    unsigned int mtextCommand = 1062;
    unsigned int plainMtextCommand = 1063;
    unsigned int mtpropCommand = 1082;
    unsigned int plainMteditCommand = 18372;
    unsigned int mtextpropertiesCommand = 52328;

    // MTEXT: status line, first and second corner.
    unsigned int statusLine = 1064;
    unsigned int annotative = 1101;
    unsigned int notAnnotative = 1102;
    unsigned int firstCorner = 1065;
    unsigned int insertionPoint = 3010;
    unsigned int oppositeCorner = 1073;

    // MTEXT: the options.
    unsigned int rotationPrompt = 1066;
    unsigned int stylePrompt = 1067;
    unsigned int listRequest = 1068;
    unsigned int unusableStyle = 1069;
    unsigned int heightPrompt = 1070;
    unsigned int paperHeightPrompt = 1103;
    unsigned int widthPrompt = 1071;
    unsigned int justificationPrompt = 1072;
    unsigned int textPrompt = 1074;
    unsigned int lineSpacingTypePrompt = 1086;
    unsigned int lineSpacingFactorPrompt = 1087;
    unsigned int invalidLineSpacing = 1096;
    unsigned int columnTypePrompt = 1105;
    unsigned int columnCountPrompt = 1109;
    unsigned int totalWidthPrompt = 1110;
    unsigned int columnWidthPrompt = 1111;
    unsigned int gutterWidthPrompt = 1112;
    unsigned int columnHeightPrompt = 1113;

    // The list of text styles.
    unsigned int stylePatternPrompt = 1075;
    unsigned int styleHeading = 1076;
    unsigned int styleNameAndFont = 1077;
    unsigned int styleSizes = 1078;
    unsigned int styleGeneration = 1079;
    unsigned int noStyleFound = 1080;
    unsigned int externalStyles = 1094;
    unsigned int currentStyle = 1081;
    unsigned int backward = 2068;
    unsigned int upsideDown = 2069;
    unsigned int vertical = 2070;
    unsigned int normal = 2071;

    // MTEDIT, -MTEDIT and the editors.
    unsigned int notWritable = 158;
    unsigned int pickText = 160;
    unsigned int onlyTheFirst = 161;
    unsigned int needsEntity = 163;
    unsigned int tooNew = 229;
    unsigned int noMultilineText = 1023;
    unsigned int inPlaceEditor = 32777;
    unsigned int onLockedLayer = 2083;
    unsigned int outsideWorkingSet = 2086;

    // MTEXTPROPERTIES, with its warning of locked layers.
    unsigned int propertyPrompt = 25585;
    unsigned int newStylePrompt = 35442;
    unsigned int unknownStyle = 33224;
    unsigned int newRotationPrompt = 35331;
    unsigned int lockedLine = 12167;
    unsigned int textsFound = 61497;
    unsigned int oneLocked = 43461;
    unsigned int manyLocked = 55963;

    // Fonts: kinds of faces, and loading.
    unsigned int trueTypeFace = 144;
    unsigned int deviceFace = 145;
    unsigned int rasterFace = 146;
    unsigned int vectorFace = 147;
    unsigned int loadingElsewhere = 169;
    unsigned int loadedElsewhere = 170;

    // Keywords of the second corner.
    unsigned int justify = 1043;
    unsigned int rotation = 1044;
    unsigned int style = 1045;
    unsigned int height = 1046;
    unsigned int width = 1059;
    unsigned int lineSpacing = 1083;
    unsigned int columns = 1104;

    // Keywords of the attachment points, row by row, and of the flow direction.
    unsigned int topLeft = 1048;
    unsigned int topCentre = 1049;
    unsigned int topRight = 1050;
    unsigned int middleLeft = 1051;
    unsigned int middleCentre = 1052;
    unsigned int middleRight = 1053;
    unsigned int bottomLeft = 1054;
    unsigned int bottomCentre = 1055;
    unsigned int bottomRight = 1056;
    unsigned int leftToRight = 1057;
    unsigned int topToBottom = 1058;

    // Keywords of the line spacing type and of the column type.
    unsigned int atLeast = 1084;
    unsigned int exactly = 1085;
    unsigned int staticColumns = 1106;
    unsigned int dynamicColumns = 1107;
    unsigned int noColumns = 1108;

    // TEXTALIGN: prompts, and the keywords of each in one text.
    unsigned int alignSelection = 57662;
    unsigned int alignSelectionKeywords = 57663;
    unsigned int alignmentPrompt = 57664;
    unsigned int alignmentKeywords = 57665;
    unsigned int alignTarget = 57666;
    unsigned int alignTargetKeywords = 57667;
    unsigned int alignFirstPoint = 57668;
    unsigned int alignSecondPoint = 57669;
    unsigned int alignSecondPointKeywords = 57670;
    unsigned int spacingPrompt = 57671;
    unsigned int spacingKeywords = 57672;
    unsigned int spacePrompt = 57691;

    // TEXTALIGN: reports.
    unsigned int alignSettings = 57689;
    unsigned int alignSpacing = 57690;
    unsigned int alignedAcross = 57692;
    unsigned int alignLeftOut = 57697;

    // TEXTALIGN: alignments and spacings as prompts and reports show them.
    unsigned int alignLeft = 57673;
    unsigned int alignCentre = 57674;
    unsigned int alignRight = 57675;
    unsigned int alignTopLeft = 57676;
    unsigned int alignTopCentre = 57677;
    unsigned int alignTopRight = 57678;
    unsigned int alignMiddleLeft = 57679;
    unsigned int alignMiddleCentre = 57680;
    unsigned int alignMiddleRight = 57681;
    unsigned int alignBottomLeft = 57682;
    unsigned int alignBottomCentre = 57683;
    unsigned int alignBottomRight = 57684;
    unsigned int spacingDistribute = 57685;
    unsigned int spacingSet = 57686;
    unsigned int spacingHorizontal = 57687;
    unsigned int spacingVertical = 57688;
    unsigned int reportDistribute = 57693;
    unsigned int reportSet = 57694;
    unsigned int reportVertical = 57695;
    unsigned int reportHorizontal = 57696;

    // Dashes and quotes.
    unsigned int emDash = 1033;
    unsigned int enDash = 1034;
    unsigned int leftQuote = 1035;
    unsigned int rightQuote = 1036;
    unsigned int leftDoubleQuote = 1037;
    unsigned int rightDoubleQuote = 1038;
};
inline constexpr TextIds kText;
