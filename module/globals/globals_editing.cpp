#include "tz/mte/globals.h"

double gdJigBoundBoxHeight = 0;
std::uint8_t gbUsedIPE = 0;
std::int32_t gMTextFixed = 0;
double g_dMTextObjectHeight = 0;
double g_dTextSize = 0;
std::int32_t gwysiwyg = 0;
TzScreenPoint gcPoint;
TzScreenRect gcRect;
std::int32_t giPoints = 16;
double gdx = 0;
double gdy = 0;
EasyObject<TzDbMText>* gpText = nullptr;
void* gpFontList = nullptr;
std::uint8_t g_bEnableFieldUI = 1;
std::int32_t gPixelsPerInch = 0;
std::int64_t TZDB_FIELDCODE_MODIFIED = 1;
