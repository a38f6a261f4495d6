#include "apps/tzconvert/normalising.h"

#include <utility>

#include "apps/tzconvert/program_texts.h"
#include "apps/tzconvert/text_codec.h"
#include "host/rtf/normaliser.h"

namespace tzconvert {
namespace {

void appendCount(std::string& text, int count, char const* one, char const* several) {
    if (count == 0) return;
    text += (text.empty() ? "" : ", ") + std::to_string(count) + " " +
            localText(count == 1 ? one : several);
}

void addWhatIsLeftOut(Warnings& warnings, tzhost::NormalisedRtf const& rtf) {
    std::string counts;
    appendCount(counts, rtf.pictures, forLocalText("picture"), forLocalText("pictures"));
    appendCount(counts, rtf.notes, forLocalText("note"), forLocalText("notes"));
    appendCount(counts, rtf.headers, forLocalText("header or footer"),
                forLocalText("headers and footers"));
    if (!counts.empty()) warnings.push_back(localText("left out: ") + counts);
}

}  // namespace

Failure readNormalised(std::string const& file, std::string& document, Warnings& warnings) {
    tzhost::NormalisedRtf rtf;
    {
        std::string bytes;
        if (Failure failure = readBytes(file, bytes)) return failure;
        addLook(warnings, Direction::normalise, bytes);
        rtf = tzhost::normaliseRtf(bytes);
    }
    addWhatIsLeftOut(warnings, rtf);
    document = std::move(rtf.document);
    return {};
}

Failure readNormalised(std::string const& file, std::wstring& text, Warnings& warnings) {
    std::string document;
    if (Failure failure = readNormalised(file, document, warnings)) return failure;
    text.reserve(document.size());
    (void)decodeText(document, text);  // it is UTF-8 without zeros
    return {};
}

}  // namespace tzconvert
