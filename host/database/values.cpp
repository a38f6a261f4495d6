#include "host/database/shape_imp.h"
#include "host/database/symbol_imp.h"

// Copies of values: each class copies itself whole. Lists are shared by copies, since undo takes
// out what a step put in.
namespace tzhost {
namespace {

unsigned int theNamesGeneration = 0;
unsigned int theLooksGeneration = 1;  // 0 stands for "never looked"

}  // namespace

void noteNamesChanged() {
    ++theNamesGeneration;
}

unsigned int namesGeneration() {
    return theNamesGeneration;
}

void noteLooksChanged() {
    ++theLooksGeneration;
}

unsigned int looksGeneration() {
    return theLooksGeneration;
}

std::unique_ptr<TzDbObjectImp> TableImp::copy() const {
    return std::make_unique<TableImp>(*this);
}

std::unique_ptr<TzDbObjectImp> LayerImp::copy() const {
    return std::make_unique<LayerImp>(*this);
}

std::unique_ptr<TzDbObjectImp> LinetypeImp::copy() const {
    return std::make_unique<LinetypeImp>(*this);
}

std::unique_ptr<TzDbObjectImp> TextStyleImp::copy() const {
    return std::make_unique<TextStyleImp>(*this);
}

std::unique_ptr<TzDbObjectImp> BlockImp::copy() const {
    return std::make_unique<BlockImp>(*this);
}

void BlockImp::loosen() {
    SymbolImp::loosen();
    entities = std::make_shared<ObjectList>();
}

std::unique_ptr<TzDbObjectImp> EntityImp::copy() const {
    return std::make_unique<EntityImp>(*this);
}

std::unique_ptr<TzDbObjectImp> LineImp::copy() const {
    return std::make_unique<LineImp>(*this);
}

std::unique_ptr<TzDbObjectImp> CircleImp::copy() const {
    return std::make_unique<CircleImp>(*this);
}

std::unique_ptr<TzDbObjectImp> InsertImp::copy() const {
    return std::make_unique<InsertImp>(*this);
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
