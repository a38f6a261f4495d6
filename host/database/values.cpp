#include "host/database/entity_imp.h"
#include "host/database/exact_values.h"
#include "host/database/symbol_imp.h"

// Copies of values of tables, records and plain entities: each class copies itself whole. Lists are
// shared by copies, since undo takes out what a step put in.
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

bool SymbolImp::isSameAs(TzDbObjectImp const& other) const {
    return TzDbObjectImp::isSameAs(other) &&
           agree(*this, static_cast<SymbolImp const&>(other), &SymbolImp::name);
}

std::unique_ptr<TzDbObjectImp> LayerImp::copy() const {
    return std::make_unique<LayerImp>(*this);
}

bool LayerImp::isSameAs(TzDbObjectImp const& other) const {
    return SymbolImp::isSameAs(other) && agree(*this, static_cast<LayerImp const&>(other),
                                               &LayerImp::locked, &LayerImp::off, &LayerImp::color);
}

std::unique_ptr<TzDbObjectImp> LinetypeImp::copy() const {
    return std::make_unique<LinetypeImp>(*this);
}

bool LinetypeImp::isSameAs(TzDbObjectImp const& other) const {
    return SymbolImp::isSameAs(other) &&
           agree(*this, static_cast<LinetypeImp const&>(other), &LinetypeImp::dashes);
}

std::unique_ptr<TzDbObjectImp> TextStyleImp::copy() const {
    return std::make_unique<TextStyleImp>(*this);
}

bool TextStyleImp::isSameAs(TzDbObjectImp const& other) const {
    return SymbolImp::isSameAs(other) &&
           agree(*this, static_cast<TextStyleImp const&>(other), &TextStyleImp::fontFile,
                 &TextStyleImp::bigFontFile, &TextStyleImp::typeface, &TextStyleImp::bold,
                 &TextStyleImp::italic, &TextStyleImp::charset, &TextStyleImp::pitchAndFamily,
                 &TextStyleImp::height, &TextStyleImp::widthFactor, &TextStyleImp::oblique,
                 &TextStyleImp::flagBits, &TextStyleImp::vertical, &TextStyleImp::annotative,
                 &TextStyleImp::paperOrientation);
}

std::unique_ptr<TzDbObjectImp> BlockImp::copy() const {
    return std::make_unique<BlockImp>(*this);
}

bool BlockImp::isSameAs(TzDbObjectImp const& other) const {
    return SymbolImp::isSameAs(other) && agree(*this, static_cast<BlockImp const&>(other),
                                               &BlockImp::origin, &BlockImp::entities);
}

void BlockImp::loosen() {
    SymbolImp::loosen();
    entities = std::make_shared<ObjectList>();
}

std::unique_ptr<TzDbObjectImp> EntityImp::copy() const {
    return std::make_unique<EntityImp>(*this);
}

bool EntityImp::isSameAs(TzDbObjectImp const& other) const {
    return TzDbObjectImp::isSameAs(other) &&
           agree(*this, static_cast<EntityImp const&>(other), &EntityImp::layer, &EntityImp::color,
                 &EntityImp::visible);
}

bool TextStyledImp::isSameAs(TzDbObjectImp const& other) const {
    return EntityImp::isSameAs(other) &&
           agree(*this, static_cast<TextStyledImp const&>(other), &TextStyledImp::style,
                 &TextStyledImp::annotative, &TextStyledImp::paperOrientation);
}

}  // namespace tzhost
