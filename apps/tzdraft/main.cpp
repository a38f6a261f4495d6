#include <cerrno>
#include <csignal>
#include <cstdio>
#include <utility>

#include "apps/tzdraft/draft_options.h"
#include "apps/tzdraft/draft_program.h"
#include "host/files/standard_streams.h"
#include "host/text/system_words.h"

namespace {

// Writes and shows at once, so that a question stands on the screen before its answer is waited
// for. False with errno when that fails.
bool write(std::FILE* stream, std::string_view text) {
    return std::fwrite(text.data(), 1, text.size(), stream) == text.size() &&
           std::fflush(stream) == 0;
}

}  // namespace

int main(int count, char** arguments) {
    tzhost::openStandardStreams();
    std::signal(SIGXFSZ, SIG_IGN);  // a limit on the size of files is an error like any other
    std::signal(SIGPIPE, SIG_IGN);  // and so is a reader that goes away
    tzdraft::ParsedOptions const parsed = tzdraft::parseOptions(count, arguments);
    if (parsed.exit) return *parsed.exit;
    if (tzdraft::plotsToOutput(parsed.options)) tzhost::keepStandardOutput();
    std::string problem;  // with the transcript, the first one
    tzdraft::Screens screens;
    screens.output = [&](std::string_view text) {
        if (problem.empty() && !write(stdout, text)) problem = tzhost::systemWords(errno);
    };
    screens.errors = [](std::string_view text) { (void)write(stderr, text); };  // the last resort
    screens.outputProblem = [&] { return problem; };
    return tzdraft::runProgram(parsed.options, std::move(screens));
}
