// Converts between MTEXT markup and RTF on the command line.

#include "apps/tzconvert/batch.h"
#include "apps/tzconvert/options.h"

int main(int count, char** arguments) {
    tzconvert::ParsedOptions const parsed = tzconvert::parseOptions(count, arguments);
    return parsed.exit ? *parsed.exit : tzconvert::run(parsed.options);
}
