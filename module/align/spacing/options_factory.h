#pragma once

#include <cstddef>
#include <vector>

#include "module/align/spacing/spacing_option.h"

// The spacing options of a run, by name. Index 0 stands for an option that is not there.
//
//   factory.registerAlignOption(new TzMTextAlignOptionDistribute);
//   use(factory.getAlignOption(L"Distribute"));   // null when there is no such option
class TzMTextAlignOptionsFactory {
public:
    TzMTextAlignOptionsFactory();
    TzMTextAlignOptionsFactory(TzMTextAlignOptionsFactory const&) = delete;
    TzMTextAlignOptionsFactory& operator=(TzMTextAlignOptionsFactory const&) = delete;
    ~TzMTextAlignOptionsFactory();

    // Takes the option over. Of options with one name the newest is found.
    void registerAlignOption(TzMTextAlignOption* option);
    // Deletes the option of that name, if there is one. Only a test calls it.
    void unregisterAlignOption(TzString const& name);
    // 0 when there is none.
    [[nodiscard]] std::size_t findOptionIndexWith(TzString const& name) const;
    [[nodiscard]] TzMTextAlignOption* getAlignOption(TzString const& name) const;
    [[nodiscard]] static bool isTheUnknownOptionIndex(std::size_t index) { return index == 0; }

private:
    static constexpr std::size_t firstMeaningfulOptionIndex() { return 1; }

    std::vector<TzMTextAlignOption*> m_options;  // owned, null at index 0
};
