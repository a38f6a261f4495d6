// Converts between MTEXT markup and RTF on the command line.

#include "apps/tzconvert/batch.h"
#include "apps/tzconvert/options.h"
#include "tz/mte/font_catalogue.h"

int main(int count, char** arguments) {
    tzconvert::ParsedOptions const parsed = tzconvert::parseOptions(count, arguments);
    int const status = parsed.exit ? *parsed.exit : tzconvert::run(parsed.options);
    // The font tables are the process's and free their entries only when they are told to.
    CTzadFontMapDatabase::RemoveAllFileToFontMapEntries();
    CTzadFontMapDatabase::RemoveAllFontToFileMapEntries();
    return status;
}
