#pragma once

#include <memory>
#include <string>

#include <gtest/gtest.h>

#include "host/database/drawing.h"
#include "tz/db/mtext.h"

// A new drawing that is worked on while a test runs; afterwards nothing may be left open.
namespace tzhost::test {

class DrawingFixture {
public:
    DrawingFixture();
    ~DrawingFixture();

    // Adds an entity to model space; it is closed again.
    TzDbObjectId add(TzDbEntity* entity);
    TzDbObjectId addText(wchar_t const* contents);
    // The entity of an id, whatever has it open.
    template <class T>
    [[nodiscard]] static T& at(TzDbObjectId id) {
        return *static_cast<T*>(id.record()->object);
    }
    TzDbObjectId addLayer(wchar_t const* name);
    TzDbObjectId addStyle(wchar_t const* name, wchar_t const* typeface);
    void lock(TzDbObjectId layer, bool locked);
    // Texts and layers by name, in order: "1 MTEXT 0|2 LINE A".
    [[nodiscard]] std::string list() const;

    std::unique_ptr<Drawing> drawing = Drawing::create();
};

class DrawingTest : public testing::Test, protected DrawingFixture {};

}  // namespace tzhost::test
