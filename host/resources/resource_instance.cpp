#include "host/base/fault_point.h"
#include "host/resources/resource_search.h"
#include "tz/rx/resource.h"

class TzRxResourceInstance::Library {
public:
    explicit Library(tzhost::ResourceFile file) : file_(std::move(file)) {}
    [[nodiscard]] tzhost::ResourceFile const& file() const { return file_; }

private:
    tzhost::ResourceFile file_;
};

TzRxResourceInstance const TzRxResourceInstance::empty;

TzRxResourceInstance::TzRxResourceInstance() = default;
TzRxResourceInstance::~TzRxResourceInstance() = default;
TzRxResourceInstance::TzRxResourceInstance(TzRxResourceInstance const&) = default;
TzRxResourceInstance& TzRxResourceInstance::operator=(TzRxResourceInstance const&) = default;

TzRxResourceInstance::TzRxResourceInstance(wchar_t const* file) {
    if (tzhost::faultAt("TzRxResourceInstance") || file == nullptr) return;
    auto opened = tzhost::openResourceFile(file);
    if (opened) library_ = std::make_shared<Library const>(std::move(*opened));
}

bool TzRxResourceInstance::isLoaded() const {
    return library_ != nullptr;
}

bool TzRxResourceInstance::tryLoadString(unsigned int id, TzString& text) const {
    if (tzhost::faultAt("TzRxResourceInstance::tryLoadString") || !library_) return false;
    auto found = library_->file().find(id);
    if (found) text = TzString(std::move(*found));
    return found.has_value();
}
