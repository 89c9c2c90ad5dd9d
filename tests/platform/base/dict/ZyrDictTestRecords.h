// Record and entity classes for tests of dictionaries and their users: two record classes, a
// dictionary of the first with a standard record, and an entity that uses a record as its style.
// Include it in one source file of a program: it defines the classes.
#pragma once

#include "platform/base/dict/ZyrDict.h"
#include "platform/base/obj/ZyrDbDictRecord.h"
#include "platform/base/obj/ZyrDbEntity.h"
#include "platform/base/obj/ZyrImpEnt.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/rx/HsRxClass.h"

class ZyrTestStyle : public ZyrDbDictRecord {
    HSRX_DECLARE_MEMBERS(ZyrTestStyle)
};
HSRX_DEFINE_MEMBERS(ZyrTestStyle, ZyrDbDictRecord, 0, hsrxInstantiateClass<ZyrTestStyle>)

class ZyrTestLabel : public ZyrDbDictRecord {
    HSRX_DECLARE_MEMBERS(ZyrTestLabel)
};
HSRX_DEFINE_MEMBERS(ZyrTestLabel, ZyrDbDictRecord, 0, hsrxInstantiateClass<ZyrTestLabel>)

class ZyrTestStyleDict : public ZyrDict {
public:
    static constexpr const wchar_t* kName = L"ZYR_TEST_STYLES";
    explicit ZyrTestStyleDict(HsDbDatabase* database, bool hasStandard = true)
        : ZyrDict(kName, ZyrTestStyle::desc(), nullptr, hasStandard, database) {}

    // A new record under a name, closed; the null id when the dictionary refuses it.
    HsDbObjectId add(const wchar_t* name) {
        HsDbObjectPointer<ZyrDbDictRecord> record(newEntry());
        HsDbObjectId id;
        addNewRecord(name, record.object(), id);
        return id;
    }
};

class ZyrTestStyledImp : public ZyrImpEnt {
    HSRX_DECLARE_MEMBERS(ZyrTestStyledImp)

public:
    HsDbObjectId styleId() const override { return m_style; }
    Hsys::ErrorStatus setStyleId(const HsDbObjectId& id) override {
        assertParentWriteEnabled();
        m_style = id;
        recordParentReferencesModified();
        return Hsys::eSuccess;
    }
    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override {
        ZyrImpEnt::getReferencedObjects(map);
        map.addRecordReference(m_style);
        return Hsys::eSuccess;
    }

private:
    HsDbObjectId m_style;
};
HSRX_DEFINE_MEMBERS(ZyrTestStyledImp, ZyrImpEnt, 0, hsrxInstantiateClass<ZyrTestStyledImp>)

// Belongs on the layer "AREA".
class ZyrTestStyledEntity : public ZyrDbEntity {
    HSRX_DECLARE_MEMBERS(ZyrTestStyledEntity)

public:
    ZyrTestStyledEntity() : ZyrDbEntity(false) { setImp(new ZyrTestStyledImp); }
    void getLayerKey(ZyrRmCString& key) const override { key = L"AREA"; }
};
HSRX_DEFINE_MEMBERS(ZyrTestStyledEntity, ZyrDbEntity, 0, hsrxInstantiateClass<ZyrTestStyledEntity>)

// Adds a styled entity to the database; its id.
inline HsDbObjectId addStyledEntity(HsDbDatabase& db, const HsDbObjectId& style) {
    HsDbObjectPointer<ZyrTestStyledEntity> entity(new ZyrTestStyledEntity);
    HsDbObjectId id;
    db.addHsDbObject(id, entity.object());
    entity->setStyleId(style);
    return id;
}

// The name a record holds itself (not its dictionary key).
inline ZyrRmCString storedName(const HsDbObjectId& id) {
    HsDbObjectPointer<ZyrDbDictRecord> record(id, HsDb::kForRead);
    ZyrRmCString name;
    record->getName(name);
    return name;
}
