#include "host/rtf/normaliser.h"

#include "host/rtf/document.h"
#include "host/rtf/tokens.h"

namespace tzhost {

namespace {

// What text has that names no size, in a document that names others.
constexpr int kUsualHalfPoints = 24;

bool namesSizes(std::string_view bytes) {
    constexpr std::string_view kWord = "\\fs";
    for (std::size_t at = 0; (at = bytes.find(kWord, at)) != bytes.npos;) {
        at += kWord.size();
        if (at < bytes.size() && bytes[at] >= '1' && bytes[at] <= '9') return true;
    }
    return false;
}

}  // namespace

NormalisedRtf normaliseRtf(std::string_view bytes, RtfReplacements const& replacements) {
    RtfDocument document(bytes.size(), namesSizes(bytes) ? kUsualHalfPoints : 0, replacements);
    RtfTokens tokens(bytes);
    for (RtfToken token = tokens.next(); token.kind != RtfToken::Kind::end; token = tokens.next())
        document.take(token);
    return document.finish();
}

}  // namespace tzhost
