#include "module/prompt/jig_entity.h"

#include "tz/db/host_services.h"

TzDbEntity* CTzsJigEntity::GetJigEntity() {
    return this;
}

TzEdJig::DragStatus CTzsJigEntity::OnSample(TzEdJig&) {
    return TzEdJig::kNoChange;
}

bool CTzsJigEntity::OnUpdate(TzEdJig&) {
    return true;
}

void CTzsJigEntity::SetBasePoint(TzGePoint3d const& point) {
    SetBasePoint({point.x, point.y, point.z});
}

void CTzsJigEntity::SetBasePoint(double const (&point)[3]) {
    for (int axis = 0; axis < 3; ++axis)
        basePoint[axis] = point[axis];
}

TzGePoint3d CTzsJigEntity::GetBasePoint() const {
    return TzGePoint3d(basePoint[0], basePoint[1], basePoint[2]);
}

CTzsJigHandler::CTzsJigHandler(CTzsJigEntity* preview, UserInputControls inputControls)
    : entity_(preview), controls_(inputControls) {
    entity_->setDatabaseDefaults(tzdbHostApplicationServices()->workingDatabase());
}

TzEdJig::DragStatus CTzsJigHandler::sampler() {
    setUserInputControls(controls_);
    if (!keywordList_.isEmpty()) setKeywordList(keywordList_);
    return entity_->OnSample(*this);
}

bool CTzsJigHandler::update() {
    return entity_->OnUpdate(*this);
}

TzDbEntity* CTzsJigHandler::entity() const {
    return entity_->GetJigEntity();
}
