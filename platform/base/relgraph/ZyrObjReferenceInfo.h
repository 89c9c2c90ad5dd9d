// One reference of an object to another: the id, how the two are related, and whether the
// referenced object goes along when the referring one is copied or exported.
#pragma once

#include "platform/host/db/HsDbObjectId.h"

class ZyrObjReferenceInfo {
public:
    // How the referring object relates to the referenced one. The numbers are part of what the
    // relationship graph answers (getReferencesToMe's types).
    enum RelationType : int {
        // A style or record that the object uses.
        kRecordRelation = 0,
        // A member that the object holds (a group's areas and child groups).
        kMemberRelation = 1,
    };

    // copyCloneType and exportCloneType: 1 when the referenced object goes along with the
    // referring one when that is copied within its drawing, or exported to another; 0 when not.
    ZyrObjReferenceInfo(const HsDbObjectId& id, int relationType, int copyCloneType,
                        int exportCloneType)
        : m_id(id), m_relationType(relationType), m_copyCloneType(copyCloneType),
          m_exportCloneType(exportCloneType) {}

    const HsDbObjectId& id() const { return m_id; }
    int relationType() const { return m_relationType; }
    int copyCloneType() const { return m_copyCloneType; }
    int exportCloneType() const { return m_exportCloneType; }

private:
    HsDbObjectId m_id;
    int m_relationType;
    int m_copyCloneType;
    int m_exportCloneType;
};
