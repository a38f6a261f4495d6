#pragma once

#include "tz/ed/selection_filter.h"

class TzApDocument;
class TzMTextAlignManipulator;

// Keeps out of every selection that runs while it lives what the alignment does not know: all but
// texts and attribute definitions.
//
//   TzEdTextSSFilter const filter(tzDocManagerPtr()->curDocument(), manipulator);
class [[nodiscard]] TzEdTextSSFilter : public TzEdSSGetFilter {
public:
    // Without a document there is nothing to filter. The manipulator outlives the filter.
    TzEdTextSSFilter(TzApDocument* document, TzMTextAlignManipulator const& manipulator);
    TzEdTextSSFilter(TzEdTextSSFilter const&) = delete;
    TzEdTextSSFilter& operator=(TzEdTextSSFilter const&) = delete;
    ~TzEdTextSSFilter() override;

    void ssgetAddFilter(int flags,
                        TzEdSelectionSetService& service,
                        TzArray<TzDbObjectId> const& selectionSet,
                        TzArray<TzDbObjectId> const& subSelectionSet) override;

private:
    TzApDocument* m_document;
    TzMTextAlignManipulator const& m_manipulator;
};
