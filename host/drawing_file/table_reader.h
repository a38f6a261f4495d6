#pragma once

#include <string>

#include "host/drawing_file/read_context.h"
#include "host/settings/variables.h"

// Reads what a drawing holds beside its entities.
namespace tzhost::drawingfile {

// The records of "layers", "linetypes" and "textStyles". A record that every drawing has takes the
// values of the file; names stand once each.
void readLayers(ReadContext& context, JsonValue const& list);
void readLinetypes(ReadContext& context, JsonValue const& list);
void readTextStyles(ReadContext& context, JsonValue const& list);

// "variables": values of variables that a drawing keeps are collected, those kept elsewhere are
// left out with a warning, and names that no variable has are kept as unknown.
void readVariables(ReadContext& context, JsonValue const& object, Variables::Values& values);

// "ucs" and "paperUcs": the axes are unit vectors at right angles.
void readUserSystem(ReadContext& context,
                    std::string const& name,
                    JsonValue const& object,
                    UserSystem& system);

// "workingSet".
void readWorkingSet(ReadContext& context, JsonValue const& object, DrawingSettings& settings);

// Adds a record with that name to a table, the values being set; the table does not have the name.
template <class Record>
TzDbObjectRecord&
addTableRecord(Drawing& drawing, TzDbObjectId table, std::unique_ptr<Record> made) {
    TzDbObjectRecord& added =
        drawing.addObject(made.get(), table.record(), Drawing::Numbered::service);
    (void)made.release();  // the drawing's now
    added.changed = false;
    (void)added.object->close();
    return added;
}

}  // namespace tzhost::drawingfile
