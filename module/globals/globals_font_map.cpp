#include "tz/mte/globals.h"

wchar_t const* gszIniSHXSectMapDatabase = L"SHX Map";
wchar_t const* gszIniPostscriptSectMapDatabase = L"Postscript Map";
wchar_t const* gszIniMiscSectMapDatabase = L"Misc Map";
wchar_t const* gszIniSectProxyFiles = L"Proxy Fonts";
wchar_t const* gszIniKeyOneWaySubst = L"OneWaySubstitution";
wchar_t const* gszIniKeyBigfontProxy = L"Default Bigfont Proxy";
TzString gsExtensionSHX(L".shx");
TzString gsIniFileDatabase;
