#include "module/align/spacing/options_factory.h"

#include <memory>

TzMTextAlignOptionsFactory::TzMTextAlignOptionsFactory() : m_options{nullptr} {}

TzMTextAlignOptionsFactory::~TzMTextAlignOptionsFactory() {
    for (TzMTextAlignOption* const option : m_options)
        delete option;
}

void TzMTextAlignOptionsFactory::registerAlignOption(TzMTextAlignOption* option) {
    std::unique_ptr<TzMTextAlignOption> held(option);  // goes when there is no room for it
    m_options.push_back(option);
    (void)held.release();
}

void TzMTextAlignOptionsFactory::unregisterAlignOption(TzString const& name) {
    std::size_t const index = findOptionIndexWith(name);
    if (isTheUnknownOptionIndex(index)) return;
    delete m_options[index];
    m_options.erase(m_options.begin() + static_cast<std::ptrdiff_t>(index));
}

std::size_t TzMTextAlignOptionsFactory::findOptionIndexWith(TzString const& name) const {
    std::size_t index = m_options.size() - 1;
    while (index >= firstMeaningfulOptionIndex() && m_options[index]->name() != name)
        --index;
    return index;
}

TzMTextAlignOption* TzMTextAlignOptionsFactory::getAlignOption(TzString const& name) const {
    return m_options[findOptionIndexWith(name)];
}
