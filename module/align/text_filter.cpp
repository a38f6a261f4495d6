#include "module/align/text_filter.h"

#include "module/align/manipulator.h"
#include "module/host_calls/selection_sets.h"

TzEdTextSSFilter::TzEdTextSSFilter(TzApDocument* document,
                                   TzMTextAlignManipulator const& manipulator)
    : m_document(document), m_manipulator(manipulator) {
    if (m_document) addSSgetFilterInputContextReactor(m_document, this, kEveryHook);
}

TzEdTextSSFilter::~TzEdTextSSFilter() {
    if (m_document) removeSSgetFilterInputContextReactor(m_document, this);
}

void TzEdTextSSFilter::ssgetAddFilter(int /*flags*/,
                                      TzEdSelectionSetService& service,
                                      TzArray<TzDbObjectId> const& /*selectionSet*/,
                                      TzArray<TzDbObjectId> const& subSelectionSet) {
    for (int index = 0; index < subSelectionSet.length(); ++index)
        if (!m_manipulator.isTextSupported(subSelectionSet[index]))
            (void)service.remove(index);  // the index stays valid after removals
}
