#include "areacalc/objects/ZyrDbAreaGroup.h"

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"
#include "areacalc/calc/ZyrAreaGroupDbOperations.h"
#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/objects/ZyrCollectionFiler.h"
#include "areacalc/objects/ZyrDbAreaGroupStyle.h"
#include "areacalc/objects/ZyrDictAreaGroupStyle.h"
#include "areacalc/objects/ZyrDictAreaProposalNames.h"
#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/geom/ZyrGeBoundBox3d.h"
#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/obj/ZyrExtentsOptions.h"
#include "platform/base/relgraph/ZyrAuditUtilities.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/base/summary/ZyrDisplayFormat.h"
#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/filer/HsDbFilerSupport.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/ge/HsGeBoundBlock3d.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <algorithm>
#include <cstdint>

ZYR_AREACALC_DEFINE_MEMBERS(ZyrImpAreaGroup, ZyrImpGeo, ZyrImpAreaGroup::kProxyFlags,
                            hsrxInstantiateClass<ZyrImpAreaGroup>, ZyrRxClassDecorator::kNoText,
                            ZyrRxClassDecorator::kNoText)
ZYR_AREACALC_DEFINE_FILED_MEMBERS(ZyrDbAreaGroup, ZyrDbGeo, L"ZYR_AREAGROUP", 28987, 28958)

namespace {

// Texts of the module's resource.
constexpr unsigned int kNewGroupName = 28973;
constexpr unsigned int kNameLabel = 29026;
constexpr unsigned int kStyleLabel = 29008;
constexpr unsigned int kMembersLabel = 29029;
constexpr unsigned int kProposalNamesLabel = 28977;
constexpr unsigned int kDirectAreasLabel = 28980;
constexpr unsigned int kDirectGroupsLabel = 28978;
constexpr unsigned int kAllAreasLabel = 28981;
constexpr unsigned int kAllGroupsLabel = 28979;
constexpr unsigned int kAreaLabel = 29017;
constexpr unsigned int kPerimeterLabel = 29018;
constexpr unsigned int kNetAreaLabel = 29048;
constexpr unsigned int kNetPerimeterLabel = 29049;

// Streams from this version on have the current layout; older ones go to bdfInFieldsQuillon.
constexpr std::int16_t kFirstCurrentLayout = 31;

// Group codes of the old text form.
enum OldTextCode : int {
    kNameCode = 1,
    kOldNameCode = 3,
    kUnknownCode = 170,
    kOwnershipCode = 171,
    kLeafCode = 330,
    kNodeCode = 340,
    kStyleCode = 341,
    kProposalNamesCode = 342,
};

ZyrRmCString text(unsigned int id) {
    return ZyrAreaCalculationBaseApp::sStringFromResource(id, false);
}

// The record class of proposal names is looked up by its name: it belongs to a later layer of the
// module. While it is not registered this is null, and an audit then accepts a record of any class.
HsRxClass* proposalNamesClass() {
    return Zyr::classNameToClass(L"ZyrDbAreaProposalNames");
}

long long countAlive(const ZyrGroupHandlerImp::IdList& ids) {
    return std::ranges::count_if(ids, [](const HsDbObjectId& id) { return !id.isErased(); });
}

} // namespace

// The locals of the old text reader: what it stores only once the read is over.
struct ZyrImpAreaGroup::OldTextFields {
    std::uint16_t ownership = ZyrGroupNodeTypes::kNodeAndLeafOwner;
    HsDbObjectId style;
    ZyrRmCString name;
    ZyrGroupHandlerImp::IdList leafs;
    ZyrGroupHandlerImp::IdList nodes;
};

// ---- ZyrImpAreaGroup ----

ZyrImpAreaGroup::ZyrImpAreaGroup() : m_name(text(kNewGroupName)) {
    std::vector<HsRxClass*> available;
    ZyrAreaCalculationAlgorithm::getAvailableAlgorithm(available);
    m_algorithms.add(available);
}

ZyrImpAreaGroup::~ZyrImpAreaGroup() = default;

Hsys::ErrorStatus ZyrImpAreaGroup::copyFrom(const HsRxObject* other) {
    if (const Hsys::ErrorStatus status = ZyrImpPair::copyFrom(other); status != Hsys::eSuccess)
        return status;
    const ZyrImpAreaGroup* source = ZyrImpAreaGroup::cast(other);
    assertParentWriteEnabled();
    if (source != this) {
        m_name = source->m_name;
        m_style = source->m_style;
    }
    m_proposalNames = source->m_proposalNames;
    // Emptied first: copied onto itself, the group is left without algorithms.
    m_algorithms.clear();
    m_algorithms.add(source->m_algorithms.items());
    static_cast<void>(m_handlerImp.copyFrom(source->m_handlerImp));
    recordParentReferencesModified();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpAreaGroup::bdfInFields(HsDbBdfFiler* filer) {
    return bdfInThisLevel(filer, [&] {
        return filedVersion() < kFirstCurrentLayout ? bdfInFieldsQuillon(filer)
                                                    : bdfInCurrentFields(filer);
    });
}

Hsys::ErrorStatus ZyrImpAreaGroup::bdfOutFields(HsDbBdfFiler* filer) const {
    return bdfOutThisLevel(filer, [&] { return bdfOutGroupFields(filer); });
}

Hsys::ErrorStatus ZyrImpAreaGroup::bdfOutGroupFields(HsDbBdfFiler* filer) const {
    filer->writeHardPointerId(m_style);
    Zyr::bdfWriteItem(filer, m_name);
    m_handlerImp.bdfOutFields(filer);
    filer->writeHardPointerId(m_proposalNames);
    return ZyrCollectionFiler::bdfWriteTranslated(filer, ZyrCollectionFiler::RxClassAsString{},
                                                  m_algorithms);
}

Hsys::ErrorStatus ZyrImpAreaGroup::bdfInCurrentFields(HsDbBdfFiler* filer) {
    HsDbObjectId style;
    ZyrRmCString name;
    // Read into a handler of its own, so that a failure further on leaves the group's as it was.
    Handler members(this);
    HsDbObjectId proposalNames;
    Algorithms algorithms;
    if (filer->readHardPointerId(style) != Hsys::eSuccess ||
        Zyr::bdfReadItem(filer, name) != Hsys::eSuccess ||
        members.bdfInFields(filer) != Hsys::eSuccess ||
        filer->readHardPointerId(proposalNames) != Hsys::eSuccess)
        return filer->filerStatus();
    if (const Hsys::ErrorStatus status = ZyrCollectionFiler::bdfReadTranslated(
            filer, ZyrCollectionFiler::RxClassAsString{}, algorithms);
        status != Hsys::eSuccess)
        return status;
    m_style = style;
    m_name = std::move(name);
    // The mode is taken as it was filed, with no range check.
    static_cast<void>(m_handlerImp.copyFrom(members));
    m_proposalNames = proposalNames;
    m_algorithms = std::move(algorithms);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpAreaGroup::bdfInFieldsQuillon(HsDbBdfFiler* filer) {
    HsDbObjectId style;
    ZyrGroupHandlerImp::IdList leafs;
    ZyrGroupHandlerImp::IdList nodes;
    ZyrRmCString name;
    std::uint16_t unknown = 0;
    std::uint16_t ownership = 0;
    HsDbObjectId proposalNames;
    OldNames oldNames;
    if (filer->readHardPointerId(style) != Hsys::eSuccess ||
        HsDbFilerSupport::bdfReadSoftPointerVector(filer, leafs, true) != Hsys::eSuccess ||
        HsDbFilerSupport::bdfReadHardPointerVector(filer, nodes, true) != Hsys::eSuccess ||
        Zyr::bdfReadItem(filer, name) != Hsys::eSuccess ||
        filer->readUInt16(unknown) != Hsys::eSuccess ||
        filer->readUInt16(ownership) != Hsys::eSuccess ||
        filer->readHardPointerId(proposalNames) != Hsys::eSuccess ||
        HsDbFilerSupport::bdfReadVector(filer, oldNames) != Hsys::eSuccess)
        return filer->filerStatus();
    takeStyle(style);
    m_handlerImp.replaceLists(std::move(nodes), std::move(leafs));
    takeName(name);
    // Old streams knew modes this release does not; such a mode leaves the group's as it is.
    static_cast<void>(m_handlerImp.setNodeOwnership(ownership));
    m_proposalNames = proposalNames;
    m_oldNames = std::move(oldNames);
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrImpAreaGroup::tdfInFieldsQuillon(HsDbTdfFiler* filer) {
    OldTextFields fields;
    Hsys::ErrorStatus status = Hsys::eSuccess;
    for (;;) {
        HsDbTdfItem item;
        const Hsys::ErrorStatus read = filer->readItem(item);
        if (read != Hsys::eSuccess) {
            status = read == Hsys::eEndOfInput ? filer->filerStatus() : read;
            break;
        }
        const OldTextItem taken = takeOldTextItem(item, fields);
        if (taken == OldTextItem::kUnknown) {
            static_cast<void>(filer->pushBackItem());
            status = filer->filerStatus();
            break;
        }
        if (taken == OldTextItem::kWrongKind) {
            filer->setError(Hsys::eBadTdfSequence, L"an old area group item of the wrong kind");
            status = Hsys::eBadTdfSequence;
            break;
        }
    }
    m_handlerImp.replaceLists(std::move(fields.nodes), std::move(fields.leafs));
    static_cast<void>(m_handlerImp.setNodeOwnership(fields.ownership));
    takeStyle(fields.style);
    takeName(fields.name);
    return status;
}

ZyrImpAreaGroup::OldTextItem ZyrImpAreaGroup::takeOldTextItem(const HsDbTdfItem& item,
                                                              OldTextFields& fields) {
    const auto kindOf = [](Hsys::ErrorStatus status) {
        return status == Hsys::eSuccess ? OldTextItem::kTaken : OldTextItem::kWrongKind;
    };
    const auto appendId = [&](ZyrGroupHandlerImp::IdList& ids) {
        HsDbObjectId id;
        const Hsys::ErrorStatus status = item.getObjectId(id);
        if (status == Hsys::eSuccess)
            ids.push_back(id);
        return kindOf(status);
    };
    switch (item.groupCode()) {
    case kNameCode: {
        std::wstring name;
        const Hsys::ErrorStatus status = item.getText(name);
        if (status == Hsys::eSuccess)
            fields.name = ZyrRmCString(std::move(name));
        return kindOf(status);
    }
    case kOldNameCode: {
        std::wstring name;
        const Hsys::ErrorStatus status = item.getText(name);
        if (status == Hsys::eSuccess)
            m_oldNames.push_back(std::move(name));
        return kindOf(status);
    }
    case kUnknownCode:
        return OldTextItem::kTaken;
    case kOwnershipCode: {
        std::int32_t ownership = 0;
        const Hsys::ErrorStatus status = item.getInteger(ownership);
        if (status == Hsys::eSuccess)
            fields.ownership = static_cast<std::uint16_t>(ownership);
        return kindOf(status);
    }
    case kLeafCode:
        return appendId(fields.leafs);
    case kNodeCode:
        return appendId(fields.nodes);
    case kStyleCode:
        return kindOf(item.getObjectId(fields.style));
    case kProposalNamesCode: {
        HsDbObjectId id;
        const Hsys::ErrorStatus status = item.getObjectId(id);
        if (status == Hsys::eSuccess)
            static_cast<void>(setProposalNamesId(id));
        return kindOf(status);
    }
    default:
        return OldTextItem::kUnknown;
    }
}

void ZyrImpAreaGroup::takeStyle(const HsDbObjectId& style) {
    if (style.isNull() || style == m_style)
        return;
    m_styleOwner->assertParentWriteEnabled();
    m_styleOwner->recordParentReferencesModified();
    m_style = style;
}

void ZyrImpAreaGroup::takeName(const ZyrRmCString& name) {
    if (name == m_name)
        return;
    m_styleOwner->assertParentWriteEnabled();
    m_name = name;
}

Hsys::ErrorStatus ZyrImpAreaGroup::audit(HsDbAuditInfo* info) {
    if (const Hsys::ErrorStatus status = ZyrImpGeo::audit(info); status != Hsys::eSuccess)
        return status;
    HsDbObject* parent = dbParent();
    if (parent == nullptr)
        return Hsys::eSuccess;
    // Printed only: a bad group style is neither counted nor repaired.
    static_cast<void>(ZyrAuditUtilities::verifySymbolReferenceAndPrintAuditError(
        info, m_styleOwner->dbParent(), m_style, ZyrDbAreaGroupStyle::desc()));
    auditProposalNames(parent, info);
    return Hsys::eSuccess;
}

void ZyrImpAreaGroup::auditProposalNames(const HsDbObject* object, HsDbAuditInfo* info) {
    if (ZyrAuditUtilities::verifySymbolReferenceAndPrintAuditError(
            info, object, m_proposalNames, proposalNamesClass()) == kGoodReference)
        return;
    // The counts are raised by their running total plus one, as the group always did.
    if (info->fixErrors()) {
        const HsDbObjectId standard =
            ZyrDictAreaProposalNames::getStandardAreaProposalNames(object->database());
        assertParentWriteEnabled();
        m_proposalNames = standard;
        recordParentReferencesModified();
        if (!m_proposalNames.isNull())
            info->errorsFixed(info->numFixes() + 1);
    }
    info->errorsFound(info->numErrors() + 1);
}

void ZyrImpAreaGroup::auditObjectIds(const HsDbEntity* entity, HsDbAuditInfo* info,
                                     std::vector<HsDbObjectId>& ids, HsRxClass* cls) {
    std::vector<HsDbObjectId> kept;
    int bad = 0;
    for (const HsDbObjectId& id : ids) {
        if (ZyrAuditUtilities::verifyEntityReferenceAndPrintAuditError(info, entity, id, cls) ==
            kGoodReference) {
            kept.push_back(id);
            continue;
        }
        ++bad;
        info->errorsFound(info->numErrors() + 1);
    }
    if (info->fixErrors() && bad > 0) {
        info->errorsFixed(info->numFixes() + bad);
        ids.swap(kept);
    }
}

Hsys::ErrorStatus ZyrImpAreaGroup::getReferencedObjects(ZyrObjReferenceMap& map) const {
    ZyrImpGeo::getReferencedObjects(map);
    map.addRecordReference(m_style);
    m_handlerImp.getReferencedObjects(map);
    map.addRecordReference(m_proposalNames);
    return Hsys::eSuccess;
}

void ZyrImpAreaGroup::summaryInfo(ZyrDesc* desc) const {
    ZyrImpGeo::summaryInfo(desc);
    desc->addText(text(kNameLabel), m_name);
    desc->addRecordName(text(kStyleLabel), &m_style, 0);
    ZyrRmCString members;
    ZyrGroupNodeTypes::displayName(m_handlerImp.nodeOwnership(), ZyrDbAreaGroup::desc(),
                                   ZyrDbArea::desc(), members);
    desc->addText(text(kMembersLabel), members);
    ZyrAreaCalculationAlgorithm::summaryAlgorithms(desc, m_algorithms.items());
    const auto* owner = ZyrDbAreaGroup::cast(dbParent());
    std::vector<HsDbObjectId> modifiers;
    if (ZyrDbAreaModifierOperations::modifiersFor(owner, modifiers) == Hsys::eSuccess)
        ZyrDbAreaModifierOperations::summaryModifiers(desc, modifiers);
    desc->addRecordName(text(kProposalNamesLabel), &m_proposalNames, 0);
    desc->addCount(text(kDirectAreasLabel), countAlive(m_handlerImp.leafs()));
    desc->addCount(text(kDirectGroupsLabel), countAlive(m_handlerImp.nodes()));
    ZyrGroupHandlerImp::IdList areas;
    static_cast<void>(m_handlerImp.leafs(areas));
    desc->addCount(text(kAllAreasLabel), countAlive(areas));
    ZyrGroupHandlerImp::IdList groups;
    static_cast<void>(m_handlerImp.nodes(groups));
    desc->addCount(text(kAllGroupsLabel), countAlive(groups));
    // A failed calculation shows 0: the statuses are not looked at.
    double values[4] = {0.0, 0.0, 0.0, 0.0};
    static_cast<void>(ZyrAreaGroupDbOperations::area(owner, values[0]));
    static_cast<void>(ZyrAreaGroupDbOperations::perimeter(owner, values[1]));
    static_cast<void>(ZyrAreaGroupDbOperations::areaModified(owner, values[2]));
    static_cast<void>(ZyrAreaGroupDbOperations::perimeterModified(owner, values[3]));
    ZyrRmCString shown;
    Zyr::formatAreaForDisplay(database(), values[0], shown);
    desc->addText(text(kAreaLabel), shown);
    desc->addDistance(text(kPerimeterLabel), Zyr::kDrawingDisplaySetting,
                      Zyr::kDrawingDisplaySetting, values[1]);
    Zyr::formatAreaForDisplay(database(), values[2], shown);
    desc->addText(text(kNetAreaLabel), shown);
    desc->addDistance(text(kNetPerimeterLabel), Zyr::kDrawingDisplaySetting,
                      Zyr::kDrawingDisplaySetting, values[3]);
}

Hsys::ErrorStatus ZyrImpAreaGroup::subSetDatabaseDefaults(HsDbDatabase* database) {
    ZyrImpGeo::subSetDatabaseDefaults(database);
    ZyrDictAreaGroupStyle styles(database);
    if (m_style.isNull() && styles.isValid(false, false))
        takeStyle(styles.standardRecord());
    if (m_proposalNames.isNull())
        static_cast<void>(
            setProposalNamesId(ZyrDictAreaProposalNames::getStandardAreaProposalNames(database)));
    return Hsys::eSuccess;
}

HsDbObjectId ZyrImpAreaGroup::styleId() const {
    return m_style;
}

Hsys::ErrorStatus ZyrImpAreaGroup::setStyleId(const HsDbObjectId& styleId) {
    if (styleId.isNull())
        return Hsys::eNullId;
    takeStyle(styleId);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpAreaGroup::getLocalExtents(HsGeBoundBlock3d& /*block*/) const {
    return Hsys::eNotImplemented;
}

Hsys::ErrorStatus ZyrImpAreaGroup::setLocalExtents(const HsGeBoundBlock3d& block, int options) {
    return ZyrImpEnt::setLocalExtents(block, options);
}

Hsys::ErrorStatus ZyrImpAreaGroup::getWorldExtents(HsGeBoundBlock3d& block) const {
    ZyrGeBoundBox3d box;
    if (const ZyrDbAreaGroup* group = ZyrDbAreaGroup::cast(dbParent())) {
        for (const HsDbObjectId& leaf : group->groupHandler()->leafs()) {
            ZyrDbArea* area = nullptr;
            if (leaf.isErased() || ZyrDbArea::open(area, leaf, HsDb::kForRead) != Hsys::eSuccess)
                continue;
            HsGeBoundBlock3d extents;
            if (const ZyrImpArea* imp = area->areaImp())
                imp->getWorldExtents(extents);
            HsGePoint3d lowest;
            HsGePoint3d highest;
            extents.getMinMaxPoints(lowest, highest);
            box.addPoint(lowest);
            box.addPoint(highest);
            area->close();
        }
    }
    block.set(box.minPoint(), box.maxPoint());
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpAreaGroup::setWorldExtents(const HsGeBoundBlock3d& block) {
    return ZyrImpEnt::setLocalExtents(block, ZyrExtentsOptions::sAcceptAll);
}

Hsys::ErrorStatus ZyrImpAreaGroup::setName(const ZyrRmCString& name) {
    takeName(name);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrImpAreaGroup::setProposalNamesId(const HsDbObjectId& id) {
    if (id == m_proposalNames)
        return Hsys::eSuccess;
    assertParentWriteEnabled();
    m_proposalNames = id;
    recordParentReferencesModified();
    return Hsys::eSuccess;
}

ZyrGroupHandler* ZyrImpAreaGroup::groupHandler() {
    assertParentWriteEnabled();
    return &m_handler;
}

ZyrImpAreaGroup::Algorithms& ZyrImpAreaGroup::algorithms() {
    assertParentWriteEnabled();
    return m_algorithms;
}

// ---- ZyrDbAreaGroup ----

void ZyrDbAreaGroup::getLayerKey(ZyrRmCString& key) const {
    key = kLayerKey;
}

void ZyrDbAreaGroup::recordForRegen() {
    if (isErased() || isUndoing())
        return;
    const ZyrBaseServices* services = ZyrBaseServices::service();
    const ZyrEditorServices* editor = services != nullptr ? services->editorServices() : nullptr;
    if (editor != nullptr && editor->isRegenerating(database()))
        return;
    const Hsys::ErrorStatus upgraded = upgradeOpen();
    if (upgraded != Hsys::eSuccess && upgraded != Hsys::eAlreadyWritable)
        return;
    assertWriteEnabled(true, true);
    if (upgraded == Hsys::eSuccess)
        static_cast<void>(downgradeOpen());
}

ZyrRmCString ZyrDbAreaGroup::name() const {
    assertReadEnabled();
    return areaGroupImp() != nullptr ? areaGroupImp()->name() : ZyrRmCString();
}

Hsys::ErrorStatus ZyrDbAreaGroup::setName(const ZyrRmCString& name) {
    return areaGroupImp() != nullptr ? areaGroupImp()->setName(name) : Hsys::eNullPointer;
}

HsDbObjectId ZyrDbAreaGroup::proposalNamesId() const {
    assertReadEnabled();
    return areaGroupImp() != nullptr ? areaGroupImp()->proposalNamesId() : HsDbObjectId();
}

Hsys::ErrorStatus ZyrDbAreaGroup::setProposalNamesId(const HsDbObjectId& id) {
    return areaGroupImp() != nullptr ? areaGroupImp()->setProposalNamesId(id) : Hsys::eNullPointer;
}

const ZyrGroupHandler* ZyrDbAreaGroup::groupHandler() const {
    assertReadEnabled();
    return requiredImp().groupHandler();
}

ZyrGroupHandler* ZyrDbAreaGroup::groupHandler() {
    assertWriteEnabled();
    return requiredImp().groupHandler();
}

const ZyrImpAreaGroup::Algorithms& ZyrDbAreaGroup::algorithms() const {
    assertReadEnabled();
    return requiredImp().algorithms();
}

ZyrImpAreaGroup::Algorithms& ZyrDbAreaGroup::algorithms() {
    assertWriteEnabled();
    return requiredImp().algorithms();
}

const ZyrImpAreaGroup& ZyrDbAreaGroup::requiredImp() const {
    if (areaGroupImp() == nullptr)
        throw HsAssertionViolation("an area group without its implementation object");
    return *areaGroupImp();
}

ZyrImpAreaGroup& ZyrDbAreaGroup::requiredImp() {
    return const_cast<ZyrImpAreaGroup&>(std::as_const(*this).requiredImp());
}
