#pragma once

#include <cstdint>
#include <deque>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <unordered_map>

#include "host/base/change_journal.h"
#include "host/database/object_record.h"
#include "host/database/undo_log.h"
#include "host/page/page.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"

// A drawing: its objects by id and handle, its tables and spaces, its settings, and the undo log.
//
//   auto drawing = tzhost::Drawing::create();     // layer 0, style Standard, both spaces
//   tzhost::setWorkingDrawing(drawing.get());
//   drawing->undoLog().begin(); ... a command ...; drawing->undoLog().end();
//
// Drawing variables live in the process's one store (host/settings/variables.h), since one drawing
// is worked on at a time; the log takes them back with the rest. Objects die with their drawing.
namespace tzhost {

// Origin and unit axes of a user system, world coordinates.
struct UserSystem {
    TzGePoint3d origin;
    TzGeVector3d xAxis = TzGeVector3d::kXAxis;
    TzGeVector3d yAxis = TzGeVector3d::kYAxis;

    // User to world.
    [[nodiscard]] TzGeMatrix3d matrix() const;
    [[nodiscard]] bool isSameAs(UserSystem const& other) const;
};

// What a drawing holds beside objects and variables.
struct DrawingSettings {
    TzDbObjectId textStyle;
    TzDbObjectId layer;
    UserSystem modelSystem;
    UserSystem paperSystem;
    bool workingSetExists = false;
    bool workingSetActive = false;
    double workingAngle = 0.0;
    std::optional<Page> page;  // nothing: plots are not on paper

    [[nodiscard]] bool isSameAs(DrawingSettings const& other) const;
};

class Drawing final : public TzDbDatabase, public TzDbWorkingGlobals {
public:
    // A new drawing: tables with layer "0", line type "Continuous" and style "Standard", and the
    // two spaces. Variables are left alone.
    [[nodiscard]] static std::unique_ptr<Drawing> create();
    ~Drawing() override;
    Drawing(Drawing const&) = delete;
    Drawing& operator=(Drawing const&) = delete;

    [[nodiscard]] Tzad::ErrorStatus getBlockTable(TzDbBlockTable*& table,
                                                  TzDb::OpenMode mode) override;
    [[nodiscard]] Tzad::ErrorStatus getLayerTable(TzDbLayerTable*& table,
                                                  TzDb::OpenMode mode) override;
    [[nodiscard]] Tzad::ErrorStatus getLinetypeTable(TzDbLinetypeTable*& table,
                                                     TzDb::OpenMode mode) override;
    [[nodiscard]] Tzad::ErrorStatus getTextStyleTable(TzDbTextStyleTable*& table,
                                                      TzDb::OpenMode mode) override;
    [[nodiscard]] TzDbObjectId textstyle() const override { return settings_.textStyle; }
    [[nodiscard]] Tzad::ErrorStatus setTextstyle(TzDbObjectId style) override;
    [[nodiscard]] TzDbObjectId clayer() const override { return settings_.layer; }
    [[nodiscard]] Tzad::ErrorStatus setClayer(TzDbObjectId layer) override;
    [[nodiscard]] TzGePoint3d ucsorg() const override { return settings_.modelSystem.origin; }
    [[nodiscard]] TzGeVector3d ucsxdir() const override { return settings_.modelSystem.xAxis; }
    [[nodiscard]] TzGeVector3d ucsydir() const override { return settings_.modelSystem.yAxis; }
    [[nodiscard]] TzGePoint3d pucsorg() const override { return settings_.paperSystem.origin; }
    [[nodiscard]] TzGeVector3d pucsxdir() const override { return settings_.paperSystem.xAxis; }
    [[nodiscard]] TzGeVector3d pucsydir() const override { return settings_.paperSystem.yAxis; }
    [[nodiscard]] bool orthomode() const override;
    Tzad::ErrorStatus setOrthomode(bool on) override;
    [[nodiscard]] TzDbObjectId objectAt(std::uint64_t handle) const override;
    [[nodiscard]] TzString fileName() const override {
        return TzString::fromUtf8(fileName_.string());
    }

    [[nodiscard]] bool hasWorkingSet() const override { return settings_.workingSetExists; }
    [[nodiscard]] bool isWorkingSetActive() const override { return settings_.workingSetActive; }
    [[nodiscard]] double workingAngle() const override { return settings_.workingAngle; }

    // The settings. Undo takes a change of them back with the command that made it.
    [[nodiscard]] DrawingSettings const& settings() const { return settings_; }
    // Puts settings in place unchecked and shows the style's name in TEXTSTYLE.
    void setSettings(DrawingSettings const& settings);
    // The same where the style stays, or in a drawing that is not worked on yet: no variable
    // changes, and nothing can fail.
    void restoreSettings(DrawingSettings const& settings) { settings_ = settings; }
    void setFile(std::filesystem::path file) { fileName_ = std::move(file); }
    [[nodiscard]] std::filesystem::path const& file() const { return fileName_; }

    // Ids of the two spaces and of the tables, and of the space that TILEMODE and CVPORT choose.
    [[nodiscard]] TzDbObjectId modelSpace() const { return modelSpace_; }
    [[nodiscard]] TzDbObjectId paperSpace() const { return paperSpace_; }
    [[nodiscard]] TzDbObjectId activeSpace() const;
    [[nodiscard]] TzDbObjectId blockTableId() const { return blocks_; }
    [[nodiscard]] TzDbObjectId layerTableId() const { return layers_; }
    [[nodiscard]] TzDbObjectId linetypeTableId() const { return linetypes_; }
    [[nodiscard]] TzDbObjectId textStyleTableId() const { return textStyles_; }
    // The record of that name in one of the tables, without opening anything; null id for none.
    [[nodiscard]] static TzDbObjectId find(TzDbObjectId table, std::wstring_view name);
    // Tells this drawing from every other of the process, closed ones included.
    [[nodiscard]] long long serial() const { return serial_; }

    [[nodiscard]] UndoLog& undoLog() { return undoLog_; }
    // What changed, taken back and done again included.
    [[nodiscard]] ChangeJournal& changes() { return changes_; }

    // Takes a new object over and gives it an id: open for write, and last in the list of `owner`,
    // if that has one. When memory fails the object stays the caller's. A handle of 0 takes the
    // next one, or none yet when `later`; tables, their records and fields have numbers of their
    // own, which no file holds.
    enum class Numbered { entity, service, later };
    [[nodiscard]] TzDbObjectRecord& addObject(TzDbObject* object,
                                              TzDbObjectRecord* owner,
                                              Numbered numbered,
                                              std::uint64_t handle = 0);
    // Gives an object that has no handle yet the next one.
    void numberObject(TzDbObjectRecord& record);

    // The highest handle that an entity may have; those above are the host's own.
    static constexpr std::uint64_t kMaxEntityHandle = (std::uint64_t{1} << 62) - 1;

    // Members of the drawing's file that this host does not know, by the path of their object.
    UnknownMembers unknown;

    // All records, in the order of their making.
    [[nodiscard]] std::deque<TzDbObjectRecord> const& records() const { return records_; }

private:
    Drawing();
    void makeTables();

    std::deque<TzDbObjectRecord> records_;
    std::unordered_map<std::uint64_t, TzDbObjectRecord*> byHandle_;
    std::uint64_t nextHandle_ = 1;
    std::uint64_t nextService_ = kMaxEntityHandle + 1;
    TzDbObjectId blocks_, layers_, linetypes_, textStyles_;
    TzDbObjectId modelSpace_, paperSpace_;
    DrawingSettings settings_;
    std::filesystem::path fileName_;
    long long serial_;
    UndoLog undoLog_;
    ChangeJournal changes_;
};

// The drawing that operations without a database work on; null for none. Not owned. Its globals are
// those of the host services.
[[nodiscard]] Drawing* workingDrawing();
void setWorkingDrawing(Drawing* drawing);
// The drawing of a database that this host made; null gives the working one.
[[nodiscard]] Drawing* drawingOf(TzDbDatabase* database);
// The drawing with that serial number, or null.
[[nodiscard]] Drawing* drawingWithSerial(long long serial);

}  // namespace tzhost
