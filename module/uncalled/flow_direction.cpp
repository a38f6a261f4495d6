#include "module/uncalled/flow_direction.h"

#include "module/texts/text_ids.h"

TzDbMText::FlowDirection MapDirection(unsigned int id) {
    return id == kText.topToBottom ? TzDbMText::kTtoB : TzDbMText::kLtoR;
}
