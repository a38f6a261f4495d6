#include "apps/tzconvert/results.h"

#include <utility>

#include "apps/tzconvert/text_codec.h"

namespace tzconvert {

Failure Results::write(std::string const& file, std::wstring_view text) {
    if (file.empty()) return writeText(text);
    std::string bytes;
    bytes.reserve(text.size());
    encodeText(text, bytes);
    return write(file, bytes);
}

Failure Results::write(std::string const& file, std::string_view bytes) {
    if (file.empty()) return writeBytes("", bytes);
    names_.reserve(names_.size() + 1);
    std::string name = file;
    std::string const reason = files_.add(file, bytes);
    if (!reason.empty()) return notWritten(file, reason);
    names_.push_back(std::move(name));  // nothing fails after the file is there
    return {};
}

std::vector<Failure> Results::settle() {
    std::vector<Failure> failures;
    for (std::string const& reason : files_.takePlaces()) {
        std::string const& name = names_[failures.size()];
        failures.push_back(reason.empty() ? Failure() : notWritten(name, reason));
    }
    names_.clear();
    return failures;
}

}  // namespace tzconvert
