// Area groups: the drawing entity that gathers areas and other groups into a tree, with a name, a
// style, a list of proposed names and the calculation algorithms that apply to it.
#pragma once

#include "areacalc/objects/ZyrDbArea.h"
#include "areacalc/objects/ZyrDbPair.h"
#include "areacalc/objects/ZyrGroupHandler.h"
#include "areacalc/objects/ZyrImpPair.h"
#include "areacalc/objects/ZyrStandardGroupHandlerImp.h"
#include "areacalc/objects/ZyrUniqueCollectionAggregate.h"
#include "platform/base/obj/ZyrDbGeo.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/base/res/ZyrRmCString.h"

#include <string>
#include <vector>

class HsDbTdfFiler;
class HsDbTdfItem;
class ZyrDbAreaGroup;

// The data of a group. It has no geometry of its own: its extents are those of its direct areas.
// Membership lies in the group handler, which keeps links on this side only.
//
// Binary filing after ZyrImpGeo's: int16 80, the style (hard pointer id), the name, the handler's
// leafs (soft pointers), nodes (hard pointers) and ownership mode, the proposal names (hard
// pointer id), the algorithms as a uint32 count and class names. Streams below version 31 have
// another layout (bdfInFieldsQuillon). A reader changes nothing unless it read every field.
class ZyrImpAreaGroup : public ZyrImpPair<ZyrImpAreaGroup, ZyrImpGeo> {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrImpAreaGroup)

public:
    using Handler = ZyrStandardGroupHandlerImp<ZyrImpAreaGroup, ZyrDbAreaGroup, ZyrDbArea>;
    using Algorithms = ZyrUniqueCollectionAggregate<HsRxClass*>;
    using OldNames = std::vector<std::basic_string<wchar_t>>;

    // The name of a new group, no style, no proposal names, mode 3, and every available
    // calculation algorithm.
    ZyrImpAreaGroup();
    ~ZyrImpAreaGroup() override;

    // The virtual operations, in the order of their slots.
    // The base's part (a failure is returned), then eBadArgument for another class. From another
    // group: name and style; from any group, itself included: proposal names, the algorithms
    // emptied and then added (so a copy onto itself leaves none), the handler's lists and mode.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    // A bad style is printed but neither counted nor repaired; bad proposal names are counted and,
    // when the audit may fix, replaced (auditProposalNames).
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    // The base's, the style, the handler's members, the proposal names.
    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override;
    // Name, style, ownership mode, algorithms, proposal names, and the counts of live members:
    // direct areas, direct groups, areas and groups of the whole tree below.
    void summaryInfo(ZyrDesc* desc) const override;
    // A null style becomes the drawing's standard group style, null proposal names the standard
    // proposal names, when the drawing has them.
    Hsys::ErrorStatus subSetDatabaseDefaults(HsDbDatabase* database) override;
    HsDbObjectId styleId() const override;
    // eNullId for the null id; references are recorded as modified on a change.
    Hsys::ErrorStatus setStyleId(const HsDbObjectId& styleId) override;
    // eNotImplemented: a group has no local extents.
    Hsys::ErrorStatus getLocalExtents(HsGeBoundBlock3d& block) const override;
    // ZyrImpEnt's.
    Hsys::ErrorStatus setLocalExtents(const HsGeBoundBlock3d& block, int options) override;
    // The box around the world extents of the live direct areas that can be opened; child groups
    // do not count. A group without such areas gives the block of an empty box. Always eSuccess.
    Hsys::ErrorStatus getWorldExtents(HsGeBoundBlock3d& block) const override;
    // ZyrImpEnt::setLocalExtents with every extent accepted.
    Hsys::ErrorStatus setWorldExtents(const HsGeBoundBlock3d& block) override;

    const ZyrRmCString& name() const { return m_name; }
    // Compared exactly, case included.
    Hsys::ErrorStatus setName(const ZyrRmCString& name);
    HsDbObjectId proposalNamesId() const { return m_proposalNames; }
    // The null id is accepted.
    Hsys::ErrorStatus setProposalNamesId(const HsDbObjectId& id);
    const ZyrGroupHandler* groupHandler() const { return &m_handler; }
    // Asserts write first.
    ZyrGroupHandler* groupHandler();
    const Algorithms& algorithms() const { return m_algorithms; }
    // Asserts write first.
    Algorithms& algorithms();
    // The names that streams below version 31 carried; nothing uses them and they are not filed
    // again.
    const OldNames& oldNames() const { return m_oldNames; }

    // Proposal names that are not a live record of their class count as one more error than the
    // audit has counted so far; when the audit may fix they become the standard ones of object's
    // drawing, and when there are such, one more fix than counted so far.
    void auditProposalNames(const HsDbObject* object, HsDbAuditInfo* info);
    // Each id that is no live entity of cls counts one more error; when the audit may fix, the
    // bad ids leave ids and are added to the fixes.
    void auditObjectIds(const HsDbEntity* entity, HsDbAuditInfo* info,
                        std::vector<HsDbObjectId>& ids, HsRxClass* cls);

    // The fields of streams below version 31, after the version word: style, leafs, nodes, name,
    // a dropped uint16, the ownership mode (a mode above 3 is not taken), proposal names, the old
    // name list. The algorithms stay as they are. The filer's status; nothing changes unless
    // every field was read.
    Hsys::ErrorStatus bdfInFieldsQuillon(HsDbBdfFiler* filer);
    // The old text form, items until one of an unknown group code, which is pushed back: 1 name,
    // 3 old name, 170 skipped, 171 ownership, 330 leaf, 340 node, 341 style, 342 proposal names.
    // Whatever the status, the read lists replace the handler's, and a stream without a name
    // empties it. The end of input is no failure; an item of a known code that holds a value of
    // another kind stops the read with eBadTdfSequence.
    Hsys::ErrorStatus tdfInFieldsQuillon(HsDbTdfFiler* filer);

private:
    enum class OldTextItem { kTaken, kUnknown, kWrongKind };
    struct OldTextFields;

    Hsys::ErrorStatus bdfInCurrentFields(HsDbBdfFiler* filer);
    Hsys::ErrorStatus bdfOutGroupFields(HsDbBdfFiler* filer) const;
    OldTextItem takeOldTextItem(const HsDbTdfItem& item, OldTextFields& fields);
    // Both through the style owner, only when the value differs; a null style is not taken. The
    // style records its changed reference.
    void takeStyle(const HsDbObjectId& style);
    void takeName(const ZyrRmCString& name);

    Handler m_handlerImp{this};
    ZyrGroupHandler m_handler{m_handlerImp};
    ZyrRmCString m_name;
    HsDbHardPointerId m_style;
    // Where the style's write checks go: the group itself.
    ZyrImpObj* m_styleOwner = this;
    Algorithms m_algorithms;
    HsDbHardPointerId m_proposalNames;
    OldNames m_oldNames;
};

// The group as the database stores it; everything is forwarded to ZyrImpAreaGroup. Getters need
// read access, and every change and the non-const handler and algorithms need write access.
class ZyrDbAreaGroup : public ZyrDbPair<ZyrDbAreaGroup, ZyrDbGeo, ZyrImpAreaGroup> {
    ZYR_AREACALC_DECLARE_FILED_MEMBERS(ZyrDbAreaGroup)

public:
    static constexpr const wchar_t* kClassIdWord = L"ZyrAreaGroup";
    // Groups go on the layer "AREAGRP" (Zyr::setLayer).
    static constexpr const wchar_t* kLayerKey = L"AREAGRP";

    using ZyrDbPair::ZyrDbPair;

    void getLayerKey(ZyrRmCString& key) const override;
    bool isModelGeometry() const override { return true; }

    // Asks for a redraw while possibly open for read only: an erased group, one being undone, or
    // one of a drawing that the editor is redrawing asks nothing. Otherwise the group is upgraded
    // for the write that records the redraw and downgraded again; a group open for write stays
    // so, and one that cannot be upgraded asks nothing.
    void recordForRegen();

    // The forwards give the values of a group without data (empty name, null id) and eNullPointer
    // for a change while the group has no ZyrImpAreaGroup; handler and algorithms have no such
    // value, and asking for them then is a programmer error (HsAssertionViolation).
    ZyrRmCString name() const;
    Hsys::ErrorStatus setName(const ZyrRmCString& name);
    HsDbObjectId proposalNamesId() const;
    Hsys::ErrorStatus setProposalNamesId(const HsDbObjectId& id);
    const ZyrGroupHandler* groupHandler() const;
    ZyrGroupHandler* groupHandler();
    const ZyrImpAreaGroup::Algorithms& algorithms() const;
    ZyrImpAreaGroup::Algorithms& algorithms();

    ZyrImpAreaGroup* areaGroupImp() { return pairImp(); }
    const ZyrImpAreaGroup* areaGroupImp() const { return pairImp(); }

private:
    const ZyrImpAreaGroup& requiredImp() const;
    ZyrImpAreaGroup& requiredImp();
};
