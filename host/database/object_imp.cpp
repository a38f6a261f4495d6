#include "host/database/object_imp.h"

#include "host/base/fault_point.h"
#include "host/database/drawing.h"
#include "host/database/exact_values.h"
#include "host/database/object_record.h"

TzDbObjectImp::~TzDbObjectImp() = default;

TzDbObjectImp::TzDbObjectImp(TzDbObjectImp const& other)
    : unknown(other.unknown ? std::make_unique<tzhost::UnknownMembers>(*other.unknown) : nullptr),
      fields(other.fields ? std::make_unique<tzhost::FieldLinks>(*other.fields) : nullptr) {}

bool TzDbObjectImp::isSameAs(TzDbObjectImp const& other) const {
    return tzhost::agree(*this, other, &TzDbObjectImp::unknown, &TzDbObjectImp::fields);
}

std::unique_ptr<TzDbObjectImp> TzDbObjectAccess::exchange(TzDbObject& object,
                                                          std::unique_ptr<TzDbObjectImp> values) {
    std::unique_ptr<TzDbObjectImp> before(object.imp_);
    object.imp_ = values.release();
    if (before && object.imp_) {
        object.imp_->record = std::exchange(before->record, nullptr);
        object.imp_->embedder = std::exchange(before->embedder, nullptr);
    }
    if (object.imp_) object.imp_->settle(object);
    return before;
}

namespace tzhost {

void beginHostChange(TzDbObject& object) {
    TzDbObjectImp* const imp = TzDbObjectAccess::imp(object);
    if (!imp) return;
    if (imp->embedder) return beginHostChange(*imp->embedder);
    if (!imp->record) return;
    imp->record->drawing->undoLog().noteChange(*imp->record);
    imp->record->drawing->changes().note(*imp->record, ChangeJournal::Kind::values);
    imp->record->changed = true;
}

Tzad::ErrorStatus beginChange(TzDbObject& object) {
    if (!object.isWriteEnabled()) return Tzad::eNotOpenForWrite;
    beginHostChange(object);
    return Tzad::eOk;
}

Tzad::ErrorStatus faultStatus(char const* operation, Tzad::ErrorStatus usual) {
    auto const fault = faultAt(operation, usual);
    return fault ? static_cast<Tzad::ErrorStatus>(*fault) : Tzad::eOk;
}

}  // namespace tzhost
