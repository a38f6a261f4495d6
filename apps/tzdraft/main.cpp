#include <csignal>
#include <cstdio>
#include <utility>

#include "apps/tzdraft/options.h"
#include "apps/tzdraft/program.h"

namespace {

// Writes and shows at once, so that a question stands on the screen before its answer is waited
// for.
void write(std::FILE* stream, std::string_view text) {
    std::fwrite(text.data(), 1, text.size(), stream);
    std::fflush(stream);
}

}  // namespace

int main(int count, char** arguments) {
    std::signal(SIGXFSZ, SIG_IGN);  // a limit on the size of files is an error like any other
    tzdraft::ParsedOptions const parsed = tzdraft::parseOptions(count, arguments);
    if (parsed.exit) return *parsed.exit;
    tzdraft::Screens screens;
    screens.output = [](std::string_view text) { write(stdout, text); };
    screens.errors = [](std::string_view text) { write(stderr, text); };
    return tzdraft::runProgram(parsed.options, std::move(screens));
}
