#pragma once

#include <string>

#include "host/database/object_imp.h"

// The values of a field.
namespace tzhost {

struct FieldImp final : TzDbObjectImp {
    [[nodiscard]] std::unique_ptr<TzDbObjectImp> copy() const override;
    [[nodiscard]] bool isSameAs(TzDbObjectImp const& other) const override;
    void onErase(bool erasing) override;

    std::wstring code;
    std::wstring shown;  // the text of the last evaluation
    bool evaluated = false;
};

}  // namespace tzhost
