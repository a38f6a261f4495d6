#include "tz/mte/globals.h"

std::int32_t g_nDefaultTabTwips = 0;
double gdTweakFactor = 0.72;
double g_dWidthFactor = 1.0;
wchar_t const* gszStartOfStackToken = L"\\S";
wchar_t const* gszEndOfStackToken = L"\\s";
TzString g_sInitialFont;
TzString gsMtextRegistryKey;

TzStackCharacters const g_stackCharacters{{L'/', L'#', L'^'}, L"TzmtedRes.dll"};
wchar_t const* const g_pszStackChars = reinterpret_cast<wchar_t const*>(&g_stackCharacters);
