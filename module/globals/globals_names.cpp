#include "tz/mte/globals.h"

TzString gsEditMtext_GlobalName;
TzString gsEditMtext_LocalName;
TzString gsCompatibleEditMtext_GlobalName;
TzString gsCompatibleEditMtext_LocalName;
TzString gsAlignText_GlobalName;
TzString gsAlignText_LocalName;
TzString gsMtext_GlobalName;
TzString gsMtext_LocalName;
TzString gsCompatibleMtext_GlobalName;
TzString gsCompatibleMtext_LocalName;
TzString gsMtprop_GlobalName;
TzString gsMtprop_LocalName;
TzString gsMtextProperties_GlobalName;
TzString gsMtextProperties_LocalName;
TzString gsServiceName;
TzString gsCommandGroupName;
TzString gsLocalizationSeparator(L" _");
