#include "module/align/manipulator.h"

#include <optional>

#include "module/align/spacing/alignment_pass.h"
#include "module/align/spacing/setting_variables.h"
#include "module/align/spacing/text_axes.h"
#include "module/align/spacing/text_planes.h"
#include "module/align/spacing/text_spacing.h"
#include "module/host_calls/selection_sets.h"
#include "tz/db/mtext.h"
#include "tz/db/text.h"
#include "tz/ed/variables.h"
#include "tz/gi/draw.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/class.h"

namespace {

constexpr wchar_t kModeVariable[] = L"TEXTALIGNMODE";
constexpr wchar_t kSpacingVariable[] = L"TEXTALIGNSPACING";

// Option name, number in the variable. The first row is taken for a name or a number that no row
// has.
struct Spacing {
    wchar_t const* name;
    tagTextSpacing number;
};
constexpr Spacing kSpacings[] = {
    {L"Distribute", tagTextSpacing::Distribute},
    {L"SpecificSpace", tagTextSpacing::SpecificSpace},
    {L"CurrentSpaceVertical", tagTextSpacing::CurrentSpaceVertical},
    {L"CurrentSpaceHorizontal", tagTextSpacing::CurrentSpaceHorizontal},
};

TzString convertTextSpacingToAlignOptionName(int number) {
    for (Spacing const& spacing : kSpacings)
        if (static_cast<int>(spacing.number) == number) return spacing.name;
    return kSpacings[0].name;
}

tagTextSpacing convertAlignOptionNameToTextSpacing(TzString const& name) {
    for (Spacing const& spacing : kSpacings)
        if (name == spacing.name) return spacing.number;
    return kSpacings[0].number;
}

TzArray<TzDbObjectId> getCandidateTexts(long long const* selection) {
    TzArray<TzDbObjectId> ids;
    for (int index = 0, length = lengthOf(selection); index < length; ++index) {
        TzDbObjectId id;
        if (entityAt(selection, index, id)) ids.append(id);
    }
    return ids;
}

// The plane of a text; nothing for what cannot be opened or lies in none.
std::optional<TzGePlane> planeOf(TzDbObjectId id) {
    EasyObject<TzDbEntity> entity;
    if (tzdbOpenObject(entity.object, id, TzDb::kForRead) != Tzad::eOk) return std::nullopt;
    TzGePlane plane;
    TzDb::Planarity planarity = TzDb::kNonPlanar;
    if (!entity->isPlanar() || entity->getPlane(plane, planarity) != Tzad::eOk) return std::nullopt;
    return plane;
}

std::optional<TzGeMatrix3d> axesOfMText(TzDbObjectId id) {
    EasyObject<TzDbMText> text;
    if (tzdbOpenObject(text.object, id, TzDb::kForRead) != Tzad::eOk) return std::nullopt;
    TzGeVector3d const normal = text->normal();
    TzGeVector3d const along = text->direction();
    TzGeMatrix3d system;
    system.setCoordSystem(text->location(), along, normal.crossProduct(along), normal);
    return system;
}

// The system that a text proposes: its own; nothing for what cannot be opened.
std::optional<TzGeMatrix3d> candidateWorkingPlaneOn(TzDbObjectId id) {
    if (id.objectClass() == TzDbMText::desc()) return axesOfMText(id);
    EasyObject<TzDbText> text;
    if (tzdbOpenObject(text.object, id, TzDb::kForRead) != Tzad::eOk) return std::nullopt;
    return calculateObjEcs(text->position(), text->normal(), text->rotation());
}

// From where the drawing is looked at, in coordinates of the user system.
std::optional<TzGeVector3d> viewDirection() {
    resbuf value{};
    if (tzedGetVar(L"VIEWDIR", &value) != Tzad::ePromptNormal) return std::nullopt;
    auto const& [x, y, z] = value.resval.rpoint;
    return TzGeVector3d(x, y, z);
}

}  // namespace

TzMTextAlignManipulator::TzMTextAlignManipulator()
    : m_supportedTypes{TzDbText::desc(), TzDbMText::desc(), TzDbAttributeDefinition::desc()} {}

TzMTextAlignManipulator::~TzMTextAlignManipulator() {
    for (TzMTextAlignManipulatorEntity* const entity : m_entities)
        delete entity;
    delete m_referenceEntity;
}

bool TzMTextAlignManipulator::insertTexts(long long const* selection) {
    TzArray<TzDbObjectId> const ids = getCandidateTexts(selection);
    if (ids.isEmpty()) return false;
    insertMajority(ids);
    setWorkingPlane();
    return true;
}

void TzMTextAlignManipulator::insertMajority(TzArray<TzDbObjectId> const& ids) {
    TextPlanes planes;
    for (TzDbObjectId const& id : ids)
        if (auto const plane = planeOf(id)) planes.insert(*plane, id);
    for (TzDbObjectId const& id : planes.majority())
        m_texts.append(id);
}

// The origin is that of the first text that reads along the chosen axes.
void TzMTextAlignManipulator::setWorkingPlane() {
    TextAxes axes;
    for (TzDbObjectId const& id : m_texts)
        if (auto const system = candidateWorkingPlaneOn(id)) axes.insert(*system);
    if (auto const system = axes.majority()) m_workingCoordSystem = *system;
}

void TzMTextAlignManipulator::addText() {
    m_entities.reserve(m_entities.size() + static_cast<std::size_t>(m_texts.length()));
    for (TzDbObjectId const& id : m_texts)
        m_entities.push_back(new TzMTextAlignManipulatorEntity(id, m_workingCoordSystem));
}

void TzMTextAlignManipulator::setTargetText(TzDbObjectId id) {
    delete m_referenceEntity;
    m_referenceEntity = nullptr;
    m_referenceEntity = new TzMTextAlignManipulatorReferenceEntity(id, m_workingCoordSystem);
    m_referenceEntity->prepareForDragging(m_direction);
}

void TzMTextAlignManipulator::setFirstPoint(TzGePoint3d const& point) {
    TzGePlane const plane = workingPlane();
    m_firstPoint = plane.isOn(point) ? point : point.orthoProject(plane);
}

void TzMTextAlignManipulator::setSecondPoint(TzGePoint3d const& point) {
    m_secondPoint = workingPlane().isOn(point) ? point : projectToWorkplaneAlongViewDir(point);
}

// While the texts are dragged the working system is the user system.
TzGePoint3d
TzMTextAlignManipulator::projectToWorkplaneAlongViewDir(TzGePoint3d const& point) const {
    auto const view = viewDirection();
    if (!view) return point;
    TzGePlane const plane = workingPlane();
    TzGeVector3d along = view->normal();
    along.transformBy(m_workingCoordSystem);
    if (along.isPerpendicularTo(plane.normal())) along = plane.normal();
    return point.project(plane, along);
}

bool TzMTextAlignManipulator::setAlignOption(TzString const& name) {
    TzMTextAlignOption* const option = m_optionsFactory.getAlignOption(name);
    if (!option) return false;
    if (option != m_option) option->initialize();
    m_option = option;
    return option->doSomething();
}

void TzMTextAlignManipulator::registerAlignOption(TzMTextAlignOption* option) {
    m_optionsFactory.registerAlignOption(option);
}

TzGePoint3d const& TzMTextAlignManipulator::firstPoint() const {
    if (!m_referenceEntity) return m_firstPoint;
    static TzGePoint3d firstRefPoint;
    firstRefPoint = m_workingCoordSystem * m_referenceEntity->referencePoint();
    return firstRefPoint;
}

TzGePlane TzMTextAlignManipulator::workingPlane() const {
    return {m_workingCoordSystem.origin(), m_workingCoordSystem.zAxis()};
}

TzGeLineSeg3d TzMTextAlignManipulator::alignmentBaseline() const {
    return {firstPoint(), m_secondPoint};
}

bool TzMTextAlignManipulator::hasLine() const {
    return firstPoint() != m_secondPoint;
}

void TzMTextAlignManipulator::prepareForDragging() {
    if (m_referenceEntity) m_referenceEntity->prepareForDragging(m_direction);
    for (TzMTextAlignManipulatorEntity* const entity : m_entities)
        entity->prepareForDragging(m_direction);
}

void TzMTextAlignManipulator::alignEntities() {
    if (!m_option || !hasLine()) return;
    TzMTextAlignManipulatorGut(m_entities, m_referenceEntity, m_option, alignmentBaseline(),
                               m_workingCoordSystem)
        .alignEntities();
}

void TzMTextAlignManipulator::updateDb() {
    if (m_option && m_option->hasError()) {
        m_option->showErrorMessage();
        return;
    }
    for (TzMTextAlignManipulatorEntity* const entity : m_entities)
        entity->replaceDbEntity();
}

void TzMTextAlignManipulator::loadDefaultSettings() {
    m_direction = static_cast<tagTextDirection>(
        getSysVarInt16(kModeVariable, static_cast<int>(tagTextDirection::Left)));
    int const spacing =
        getSysVarInt16(kSpacingVariable, static_cast<int>(tagTextSpacing::Distribute));
    m_option = m_optionsFactory.getAlignOption(convertTextSpacingToAlignOptionName(spacing));
    if (m_option) m_option->loadDefaultSettings();
}

// A setting that the host refuses is not remembered; the texts are aligned all the same.
void TzMTextAlignManipulator::saveAsDefaultSettings() {
    (void)setSysVarInt16(kModeVariable, static_cast<int>(m_direction));
    if (!m_option) return;
    tagTextSpacing const spacing = convertAlignOptionNameToTextSpacing(m_option->name());
    (void)setSysVarInt16(kSpacingVariable, static_cast<int>(spacing));
    m_option->saveAsDefaultSettings();
}

bool TzMTextAlignManipulator::isTextSupported(TzDbObjectId id) const {
    return m_supportedTypes.contains(id.objectClass());
}

void TzMTextAlignManipulator::addSupportedEntityType(TzRxClass* kind) {
    m_supportedTypes.append(kind);
}

bool TzMTextAlignManipulator::subWorldDraw(TzGiWorldDraw* draw) {
    bool isDrawn = true;
    if (!hasLine()) return isDrawn;
    for (TzMTextAlignManipulatorEntity* const entity : m_entities)
        isDrawn = entity->worldDraw(draw) && isDrawn;
    return isDrawn;
}

void TzMTextAlignManipulator::subViewportDraw(TzGiViewportDraw* draw) {
    if (!hasLine()) return;
    for (TzMTextAlignManipulatorEntity* const entity : m_entities)
        entity->viewportDraw(draw);
}
