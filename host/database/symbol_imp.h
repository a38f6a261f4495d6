#pragma once

#include <memory>
#include <string>
#include <vector>

#include "host/database/object_imp.h"
#include "host/database/object_list.h"
#include "tz/db/symbol_table.h"
#include "tz/ge/point3d.h"

// The values of tables and of their records.
namespace tzhost {

// Called when a listed record gets another name, so that indices by name are made anew.
void noteNamesChanged();
[[nodiscard]] unsigned int namesGeneration();
// Called when a text style changes, so that texts are measured anew.
void noteLooksChanged();
[[nodiscard]] unsigned int looksGeneration();

struct TableImp final : TzDbObjectImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] ObjectList* list() override { return &shared->list; }

    struct Shared {
        ObjectList list;
        NameIndex names;
    };
    std::shared_ptr<Shared> shared = std::make_shared<Shared>();
};

struct SymbolImp : TzDbObjectImp {
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;

    std::wstring name;
};

struct LayerImp final : SymbolImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;

    bool locked = false;
    bool off = false;
    TzCmColor color = TzCmEntityColor::fromIndex(7);
};

struct LinetypeImp final : SymbolImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;

    std::vector<double> dashes;
};

struct TextStyleImp final : SymbolImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;
    void forgetComputed() override { noteLooksChanged(); }

    std::wstring fontFile = L"txt.shx";
    std::wstring bigFontFile;
    std::wstring typeface;
    bool bold = false;
    bool italic = false;
    int charset = 0;
    int pitchAndFamily = 0;
    double height = 0.0;
    double widthFactor = 1.0;
    double oblique = 0.0;
    int flagBits = 0;
    bool vertical = false;
    bool annotative = false;
    bool paperOrientation = false;
};

struct BlockImp final : SymbolImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;

    [[nodiscard]] ObjectList* list() override { return entities.get(); }
    // A copy of a block definition is empty.
    void loosen() override;

    TzGePoint3d origin;
    std::shared_ptr<ObjectList> entities = std::make_shared<ObjectList>();
};

}  // namespace tzhost
