#include "host/text/filled.h"

#include <algorithm>

#include "host/text/local_text.h"

namespace tzhost {
namespace {

constexpr std::string_view kPlace = "%s";

// What stands around the places, one piece more than there are places.
std::vector<std::string_view> piecesOf(std::string_view text) {
    std::vector<std::string_view> pieces;
    for (std::size_t at = text.find(kPlace); at != text.npos; at = text.find(kPlace)) {
        pieces.push_back(text.substr(0, at));
        text.remove_prefix(at + kPlace.size());
    }
    pieces.push_back(text);
    return pieces;
}

}  // namespace

std::string filled(std::string_view text, TextParts const& parts) {
    std::vector<std::string_view> const pieces = piecesOf(text);
    std::string whole(pieces[0]);
    for (std::size_t place = 1; place < pieces.size(); ++place) {
        if (place <= parts.size()) whole += parts[place - 1];
        whole += pieces[place];
    }
    return whole;
}

std::optional<TextParts> partsOf(std::string_view message, std::string_view text) {
    std::vector<std::string_view> const pieces = piecesOf(text);
    if (!message.starts_with(pieces[0])) return std::nullopt;
    message.remove_prefix(pieces[0].size());
    TextParts parts;
    for (std::size_t place = 1; place < pieces.size(); ++place) {
        bool const isLast = place + 1 == pieces.size();
        std::size_t const at = isLast ? message.rfind(pieces[place]) : message.find(pieces[place]);
        if (at == message.npos) return std::nullopt;
        parts.emplace_back(message.substr(0, at));
        message.remove_prefix(at + pieces[place].size());
    }
    if (!message.empty()) return std::nullopt;
    return parts;
}

std::string localMessage(std::string const& message,
                         std::span<char const* const> texts,
                         std::string (*part)(std::string const&)) {
    for (char const* const text : texts) {
        if (auto parts = partsOf(message, text)) {
            std::transform(parts->begin(), parts->end(), parts->begin(), part);
            return filled(localText(text), *parts);
        }
    }
    return message;
}

}  // namespace tzhost
