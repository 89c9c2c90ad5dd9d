#include "areacalc/objects/ZyrDbArea.h"

#include "areacalc/calc/ZyrAreaDbOperations.h"
#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/objects/ZyrDbAreaGroup.h"
#include "areacalc/objects/ZyrDbAreaStyle.h"
#include "areacalc/objects/ZyrDictAreaStyle.h"
#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/app/ZyrHdxEquipment.h"
#include "platform/base/obj/ZyrExtentsOptions.h"
#include "platform/base/obj/ZyrScaleInfo.h"
#include "platform/base/obj/ZyrTol.h"
#include "platform/base/relgraph/ZyrAuditUtilities.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/base/relgraph/ZyrObjRelGraph.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/base/summary/ZyrDisplayFormat.h"
#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbPolyline.h"
#include "platform/host/ge/HsGeBoundBlock3d.h"

#include <cmath>

ZYR_AREACALC_DEFINE_MEMBERS(ZyrImpArea, ZyrImpGeo, ZyrImpArea::kProxyFlags,
                            hsrxInstantiateClass<ZyrImpArea>, ZyrRxClassDecorator::kNoText,
                            ZyrRxClassDecorator::kNoText)
ZYR_AREACALC_DEFINE_FILED_MEMBERS(ZyrDbArea, ZyrDbGeo, L"ZYR_AREA", 29007, 28957)

namespace {

// Texts of the module's resource.
constexpr unsigned int kNewAreaName = 29015;
constexpr unsigned int kNameLabel = 29026;
constexpr unsigned int kStyleLabel = 29010;
constexpr unsigned int kAreaLabel = 29017;
constexpr unsigned int kPerimeterLabel = 29018;
constexpr unsigned int kInvalidProfileNote = 29052;
constexpr unsigned int kNetAreaLabel = 29048;
constexpr unsigned int kNetPerimeterLabel = 29049;

ZyrRmCString text(unsigned int id) {
    return ZyrAreaCalculationBaseApp::sStringFromResource(id, false);
}

} // namespace

// ---- ZyrImpArea ----

ZyrImpArea::ZyrImpArea() : m_name(text(kNewAreaName)) {}

ZyrImpArea::~ZyrImpArea() = default;

Hsys::ErrorStatus ZyrImpArea::copyFrom(const HsRxObject* other) {
    ZyrImpGeo::copyFrom(other);
    const ZyrImpArea* source = ZyrImpArea::cast(other);
    if (source == nullptr)
        return Hsys::eBadArgument;
    if (source == this)
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    m_profile.reset();
    if (source->m_profile != nullptr) {
        m_profile = std::make_unique<ZyrGeProfile>(*source->m_profile);
        // Nested below this area, so that a change of the copy asks write of the area too.
        m_profile->setParent(static_cast<ZyrImpObj*>(this));
    }
    m_style = source->m_style;
    m_name = source->m_name;
    recordParentReferencesModified();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArea::bdfInFields(HsDbBdfFiler* filer) {
    return bdfInThisLevel(filer, [&] { return bdfInAreaFields(filer); });
}

Hsys::ErrorStatus ZyrImpArea::bdfOutFields(HsDbBdfFiler* filer) const {
    return bdfOutThisLevel(filer, [&] { return bdfOutAreaFields(filer); });
}

Hsys::ErrorStatus ZyrImpArea::bdfOutAreaFields(HsDbBdfFiler* filer) const {
    filer->writeHardPointerId(m_style);
    if (const Hsys::ErrorStatus status = Zyr::writeObject(
            filer, m_profile.get(), static_cast<unsigned short>(Zyr::kCurrentVersion));
        status != Hsys::eSuccess)
        return status;
    return Zyr::bdfWriteItem(filer, m_name);
}

Hsys::ErrorStatus ZyrImpArea::bdfInAreaFields(HsDbBdfFiler* filer) {
    HsDbObjectId style;
    if (filer->readHardPointerId(style) != Hsys::eSuccess)
        return filer->filerStatus();
    ZyrImpObj* nested = nullptr;
    if (const Hsys::ErrorStatus status =
            Zyr::readObject(filer, this, nested, static_cast<unsigned short>(filedVersion()));
        status != Hsys::eSuccess)
        return status;
    std::unique_ptr<ZyrImpObj> read(nested);
    if (read != nullptr && ZyrGeProfile::cast(read.get()) == nullptr) {
        filer->setFilerStatus(Hsys::eFilerError);
        return Hsys::eWrongClass;
    }
    ZyrRmCString name;
    if (const Hsys::ErrorStatus status = Zyr::bdfReadItem(filer, name); status != Hsys::eSuccess)
        return status;
    m_style = style;
    m_profile.reset(static_cast<ZyrGeProfile*>(read.release()));
    m_name = std::move(name);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArea::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = ZyrImpGeo::audit(info); status != Hsys::eSuccess)
        return status;
    HsDbObject* parent = dbParent();
    if (parent == nullptr)
        return Hsys::eSuccess;
    if (ZyrAuditUtilities::verifySymbolReferenceAndPrintAuditError(
            info, parent, m_style, ZyrDbAreaStyle::desc()) == kGoodReference)
        return Hsys::eSuccess;
    if (info->fixErrors()) {
        assertParentWriteEnabled();
        m_style.setNull();
        setStyleId(ZyrDictAreaStyle::getStandardAreaStyle(parent->database()));
        if (!m_style.isNull())
            info->errorsFixed(1);
    }
    info->errorsFound(1);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArea::getReferencedObjects(ZyrObjReferenceMap& map) const {
    ZyrImpGeo::getReferencedObjects(map);
    map.addRecordReference(m_style);
    if (m_profile != nullptr)
        m_profile->getReferencedObjects(map);
    return Hsys::eSuccess;
}

void ZyrImpArea::summaryInfo(ZyrDesc* desc) const {
    ZyrImpGeo::summaryInfo(desc);
    desc->addText(text(kNameLabel), m_name);
    desc->addRecordName(text(kStyleLabel), &m_style, 0);
    // The values through modifiers need the public object, which carries the modifiers; an
    // implementation object on its own has none, so its net values are its gross ones.
    auto* owner = const_cast<ZyrDbArea*>(ZyrDbArea::cast(dbParent()));
    std::vector<HsDbObjectId> modifiers;
    if (ZyrDbAreaModifierOperations::modifiersFor(owner, modifiers) == Hsys::eSuccess)
        ZyrDbAreaModifierOperations::summaryModifiers(desc, modifiers);
    double netArea = area();
    double netPerimeter = perimeter();
    if (owner != nullptr) {
        static_cast<void>(ZyrAreaDbOperations::areaModified(owner, netArea));
        static_cast<void>(ZyrAreaDbOperations::perimeterModified(owner, netPerimeter));
    }
    const bool invalid = m_profile != nullptr && !m_profile->isValidProfile(false);
    desc->addText(text(kAreaLabel), areaForDisplay(area(), invalid));
    desc->addDistance(text(kPerimeterLabel), Zyr::kDrawingDisplaySetting,
                      Zyr::kDrawingDisplaySetting, perimeter());
    desc->addText(text(kNetAreaLabel), areaForDisplay(netArea, invalid));
    desc->addDistance(text(kNetPerimeterLabel), Zyr::kDrawingDisplaySetting,
                      Zyr::kDrawingDisplaySetting, netPerimeter);
}

ZyrRmCString ZyrImpArea::areaForDisplay(double value, bool invalidProfile) const {
    if (invalidProfile)
        return text(kInvalidProfileNote);
    ZyrRmCString shown;
    Zyr::formatAreaForDisplay(database(), value, shown);
    return shown;
}

Hsys::ErrorStatus ZyrImpArea::subSetDatabaseDefaults(HsDbDatabase* database) {
    ZyrImpGeo::subSetDatabaseDefaults(database);
    if (m_style.isNull())
        setStyleId(ZyrDictAreaStyle::getStandardAreaStyle(database));
    if (m_profile != nullptr)
        m_profile->subSetDatabaseDefaults(database);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArea::scaleBy(const ZyrScaleInfo& info) {
    if (const Hsys::ErrorStatus status = ZyrImpGeo::scaleBy(info); status != Hsys::eSuccess)
        return status;
    if (m_profile == nullptr)
        return Hsys::eSuccess;
    return m_profile->scale(std::abs(info.x), std::abs(info.y));
}

HsDbObjectId ZyrImpArea::styleId() const {
    return m_style;
}

Hsys::ErrorStatus ZyrImpArea::setStyleId(const HsDbObjectId& styleId) {
    if (styleId.isNull())
        return Hsys::eNullId;
    if (styleId == m_style)
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    m_style = styleId;
    recordParentReferencesModified();
    return Hsys::eSuccess;
}

ZyrGeProfile* ZyrImpArea::getProfile(const HsGePlane& /*plane*/) const {
    if (m_profile == nullptr)
        return nullptr;
    auto turned = std::make_unique<ZyrGeProfile>(*m_profile);
    turned->transformBy(HsGeMatrix3d::translation(-ecs().translation()) * ecs());
    return turned.release();
}

void ZyrImpArea::refreshProfileExtents() const {
    if (m_profile->isExtentsStale())
        m_profile->updateExtents();
}

Hsys::ErrorStatus ZyrImpArea::getLocalExtents(HsGeBoundBlock3d& block) const {
    if (m_profile == nullptr)
        return Hsys::eBadArgument;
    refreshProfileExtents();
    const double width = m_profile->right() - m_profile->left();
    const double height = m_profile->top() - m_profile->bottom();
    block.set(HsGePoint3d(m_profile->left(), m_profile->bottom(), 0.0),
              HsGeVector3d(width, 0.0, 0.0), HsGeVector3d(0.0, height, 0.0), HsGeVector3d::kZAxis);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArea::setLocalExtents(const HsGeBoundBlock3d& block, int options) {
    if (m_profile == nullptr)
        return Hsys::eBadArgument;
    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
    Zyr::boundBlockToDims(block, x, y, z);
    refreshProfileExtents();
    if ((options & ZyrExtentsOptions::sIgnoreX) != 0)
        x = m_profile->right() - m_profile->left();
    if ((options & ZyrExtentsOptions::sIgnoreY) != 0)
        y = m_profile->top() - m_profile->bottom();
    if ((options & ZyrExtentsOptions::sIgnoreZ) != 0)
        z = 0.0;
    // Z only has to be there, and is tested with its sign: a block of negative height fails.
    const double tight = ZyrTol::sTight;
    if (!(std::abs(x) > tight) || !(std::abs(y) > tight) || !(z > tight))
        return Hsys::eBadArgument;
    assertParentWriteEnabled();
    m_profile->setExtent(x, y);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArea::getWorldExtents(HsGeBoundBlock3d& block) const {
    getLocalExtents(block);
    block.transformBy(ecs());
    return Hsys::eSuccess;
}

HsDbEntity* ZyrImpArea::getBaseCurve() const {
    if (m_profile == nullptr || m_profile->ringCount() == 0)
        return ZyrImpGeo::getBaseCurve();
    auto curve = std::make_unique<HsDbPolyline>();
    curve->setPlinegen(true);
    curve->setClosed(true);
    const ZyrGeRing* outer = m_profile->ring(0);
    for (int i = 0; i < outer->segmentCount(); ++i) {
        const ZyrGeSegment2d* segment = outer->segment(i);
        curve->addVertexAt(static_cast<unsigned int>(i), segment->startPoint(), segment->bulge(),
                           -1.0, -1.0);
    }
    curve->transformBy(ecs());
    return curve.release();
}

ZyrGeProfile* ZyrImpArea::getBaseProfile(HsGeMatrix3d& ecs) {
    ZyrImpGeo::ecs(ecs);
    return m_profile.get();
}

Hsys::ErrorStatus ZyrImpArea::setBaseProfile(ZyrGeProfile* profile, const HsGeMatrix3d& ecs) {
    setProfile(profile);
    setEcs(ecs, true);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpArea::setAreaName(const ZyrRmCString& name) {
    return ZyrHdxEquipment::setString(this, name, m_name);
}

Hsys::ErrorStatus ZyrImpArea::setProfile(ZyrGeProfile* profile) {
    if (profile == nullptr || profile == m_profile.get())
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    profile->setParent(static_cast<ZyrImpObj*>(this));
    m_profile.reset(profile);
    return Hsys::eSuccess;
}

double ZyrImpArea::area() const {
    return m_profile != nullptr ? m_profile->area(0.0) : 0.0;
}

double ZyrImpArea::perimeter() const {
    if (m_profile == nullptr)
        return 0.0;
    double length = 0.0;
    for (int i = 0; i < m_profile->ringCount(); ++i)
        if (const ZyrGeRing* ring = m_profile->ring(i))
            length += ring->length();
    return length;
}

// ---- ZyrDbArea ----

namespace {

// Takes the area out of every group that refers to it; what cannot be opened or upgraded stays.
void leaveGroups(const ZyrDbArea& area) {
    ZyrBaseServices* services = ZyrBaseServices::service();
    ZyrObjRelGraph* graph = services != nullptr ? services->objRelGraph(area.database()) : nullptr;
    if (graph == nullptr)
        return;
    HsArray<HsDbObjectId> referrers;
    HsArray<int> types;
    static_cast<void>(graph->getReferencesToMe(&area, referrers, types, true));
    for (int i = 0; i < referrers.length(); ++i) {
        ZyrDbAreaGroup* group = nullptr;
        if (ZyrDbAreaGroup::open(group, referrers[i], HsDb::kForRead) != Hsys::eSuccess)
            continue;
        if (group->upgradeOpen() == Hsys::eSuccess) {
            static_cast<void>(group->groupHandler()->removeLeaf(area.objectId()));
            static_cast<void>(group->downgradeOpen());
        }
        group->close();
    }
}

} // namespace

Hsys::ErrorStatus ZyrDbArea::subHandOverTo(HsDbObject* newObject) {
    const Hsys::ErrorStatus status = ZyrDbGeo::subHandOverTo(newObject);
    if (status != Hsys::eSuccess)
        return status;
    if (newObject == nullptr || newObject->isA() != ZyrDbArea::desc())
        leaveGroups(*this);
    return status;
}

void ZyrDbArea::getLayerKey(ZyrRmCString& key) const {
    key = kLayerKey;
}

ZyrRmCString ZyrDbArea::name() const {
    assertReadEnabled();
    const ZyrImpArea* imp = areaImp();
    return imp != nullptr ? imp->areaName() : ZyrRmCString();
}

Hsys::ErrorStatus ZyrDbArea::setName(const ZyrRmCString& name) {
    return areaImp() != nullptr ? areaImp()->setAreaName(name) : Hsys::eNullPointer;
}

double ZyrDbArea::area() const {
    assertReadEnabled();
    const ZyrImpArea* imp = areaImp();
    return imp != nullptr ? imp->area() : 0.0;
}

double ZyrDbArea::perimeter() const {
    assertReadEnabled();
    return areaImp() != nullptr ? areaImp()->perimeter() : 0.0;
}

ZyrGeProfile* ZyrDbArea::profile() const {
    assertReadEnabled();
    return areaImp() != nullptr ? areaImp()->profile() : nullptr;
}

Hsys::ErrorStatus ZyrDbArea::setProfile(ZyrGeProfile* profile) {
    return areaImp() != nullptr ? areaImp()->setProfile(profile) : Hsys::eNullPointer;
}
