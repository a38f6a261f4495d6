#pragma once

#include <memory>

#include "module/align/manipulator.h"
#include "tz/ed/jig.h"

// One run of TEXTALIGN: moves texts so that a chosen point of each lies on a line that the user
// draws.
//
//   TzMTextAlignCmd command;
//   command.run();
//
// The drawing changes only at the end. The destructor takes back the highlighting and the user
// system on every way out.
class TzMTextAlignCmd {
public:
    TzMTextAlignCmd();
    TzMTextAlignCmd(TzMTextAlignCmd const&) = delete;
    TzMTextAlignCmd& operator=(TzMTextAlignCmd const&) = delete;
    ~TzMTextAlignCmd();

    // The whole dialogue. The settings are remembered when it is finished; after a cancel, changes
    // made by its keywords are lost.
    void run();
    // The first part of it on its own: the selection, and the entities that are dragged. Nothing
    // calls it.
    bool acquireTextObjsAndAlignSettings();

    // Questions of the run, for the keywords of others too. A status of the host; choosing the
    // justification that is in force already reads as a cancel.
    int acquireAlignOption();
    int acquireAlignDirection();
    void reportCurrentSettings() const;

private:
    // Steps of the run; false ends it.
    bool selectTextEntity();
    bool acquireFirstPoint();
    bool pickFirstPoint();
    bool dragToAlign();

    void takeSelection(long long const* selection);
    void setUserSystem();
    bool targetTextReferencePoint(long long const* name);
    void reportCurrentOption() const;
    void reportNonCoplanarEntities(long long const* selection) const;
    [[nodiscard]] static bool isSettingOption(TzEdJig::DragStatus status);

    std::unique_ptr<TzMTextAlignManipulator> m_manipulator;
    TzGePoint3d m_firstPoint;  // as it was typed, world coordinates
    bool m_ucsChanged = false;
};
