#include "host/entities/shape_imp.h"

#include "host/database/exact_values.h"
#include "host/database/object_record.h"

namespace tzhost {

std::unique_ptr<TzDbObjectImp> LineImp::copy() const {
    return std::make_unique<LineImp>(*this);
}

bool LineImp::isSameAs(TzDbObjectImp const& other) const {
    return EntityImp::isSameAs(other) &&
           agree(*this, static_cast<LineImp const&>(other), &LineImp::start, &LineImp::end);
}

std::unique_ptr<TzDbObjectImp> CircleImp::copy() const {
    return std::make_unique<CircleImp>(*this);
}

bool CircleImp::isSameAs(TzDbObjectImp const& other) const {
    return EntityImp::isSameAs(other) &&
           agree(*this, static_cast<CircleImp const&>(other), &CircleImp::center,
                 &CircleImp::normal, &CircleImp::radius);
}

std::unique_ptr<TzDbObjectImp> InsertImp::copy() const {
    return std::make_unique<InsertImp>(*this);
}

bool InsertImp::isSameAs(TzDbObjectImp const& other) const {
    return EntityImp::isSameAs(other) &&
           agree(*this, static_cast<InsertImp const&>(other), &InsertImp::block,
                 &InsertImp::position, &InsertImp::normal, &InsertImp::rotation, &InsertImp::scale,
                 &InsertImp::attributes);
}

void InsertImp::loosen() {
    EntityImp::loosen();
    attributes = std::make_shared<ObjectList>(*attributes);
}

void InsertImp::onErase(bool erasing) {
    for (TzDbObjectRecord* const attribute : attributes->items) {
        beginHostChange(*attribute->object);
        attribute->erased = erasing;
    }
}

}  // namespace tzhost
