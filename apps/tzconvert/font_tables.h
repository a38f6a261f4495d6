#pragma once

#include <cstddef>
#include <memory>

namespace tzhost {
class IniData;
}

namespace tzconvert {

// The font tables of the process, as each conversion begins with them: filled from the font map
// file and from nothing else. The rows of the map are read again only when a conversion or another
// program changed something.
class FontTables {
public:
    // To be called before each conversion; no font map object may be alive.
    void prepare();

private:
    [[nodiscard]] bool areFresh() const;

    std::shared_ptr<tzhost::IniData const> map_;  // what they were filled from; null before
    std::size_t files_ = 0;                       // entries then
    std::size_t faces_ = 0;
};

}  // namespace tzconvert
