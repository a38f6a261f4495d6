// Converts between MTEXT markup and RTF on the command line.

#include <cstdlib>
#include <new>

#include <sys/mman.h>

#include "apps/tzconvert/batch.h"
#include "apps/tzconvert/options.h"
#include "host/files/standard_streams.h"
#include "tz/mte/font_map_catalogue.h"

namespace {

constexpr std::size_t kLargePage = std::size_t{2} << 20;

// A block of whole large pages, where the system has them: most of the time of a large conversion
// is the first touch of its memory, which costs the less the fewer pages there are.
void* largeBlock(std::size_t size) {
    size = (size + kLargePage - 1) / kLargePage * kLargePage;
    void* const block = std::aligned_alloc(kLargePage, size);
    if (block) (void)::madvise(block, size, MADV_HUGEPAGE);  // without them it is slower, no more
    return block;
}

}  // namespace

void* operator new(std::size_t size) {
    constexpr std::size_t kLargest = static_cast<std::size_t>(-1) / 2;
    if (size > kLargest) throw std::bad_alloc();
    for (;;) {
        if (void* const block = size < kLargePage ? std::malloc(size ? size : 1) : largeBlock(size))
            return block;
        std::new_handler const handler = std::get_new_handler();
        if (!handler) throw std::bad_alloc();
        handler();
    }
}

// All forms are of one kind: a sanitizer keeps its own of those that are not here.
void* operator new(std::size_t size, std::nothrow_t const&) noexcept {
    try {
        return operator new(size);
    } catch (std::bad_alloc const&) {
        return nullptr;
    }
}

void operator delete(void* block) noexcept {
    std::free(block);
}

void operator delete(void* block, std::size_t) noexcept {
    std::free(block);
}

int main(int count, char** arguments) {
    tzhost::openStandardStreams();
    tzconvert::ParsedOptions const parsed = tzconvert::parseOptions(count, arguments);
    int const status = parsed.exit ? *parsed.exit : tzconvert::run(parsed.options);
    // The font tables are the process's and free their entries only when they are told to.
    CTzadFontMapDatabase::RemoveAllFileToFontMapEntries();
    CTzadFontMapDatabase::RemoveAllFontToFileMapEntries();
    return status;
}
