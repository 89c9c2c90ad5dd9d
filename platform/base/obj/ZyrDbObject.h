// The public base of every persistent non-entity pair: what the database stores, owning the
// implementation object that holds the data.
#pragma once

#include "platform/base/obj/ZyrDbImpOwner.h"
#include "platform/host/db/HsDbObject.h"

#include <cstdint>

struct _GUID;

// The public object forwards to its implementation object and drives it through the host's
// protocol: filing, audit, copy, database defaults and references all reach it from here.
//
// Binary filing: HsDbObject's fields, int16 80, then the implementation object nested with its
// class (Zyr::writeObject), so that a derived public class with no fields of its own adds
// exactly its own int16 80 after this.
class ZyrDbObject : public HsDbObject, public ZyrDbImpOwner {
    HSRX_DECLARE_MEMBERS(ZyrDbObject)

public:
    // createImp true gives the object a plain ZyrImpObj, which a derived class replaces with
    // setImp; false leaves it without one until someone calls setImp.
    explicit ZyrDbObject(bool createImp = true);
    ~ZyrDbObject() override;

    // The virtual operations, in the order of their slots.
    // The implementation object of another ZyrDbObject (copied, or cloned when the classes
    // differ); eBadArgument for any other object. Needs write.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    void subSetDatabaseDefaults(HsDbDatabase* database) override;
    // HsDbObject's audit, then the implementation object's.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    // HsDbObject's text fields, then the implementation object's.
    Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer) override;
    Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const override;
    // The id derived from the class's registered name (Zyr::constructClassID and
    // Zyr::getObjectClassIdFromString); classes with a class-id word of their own override it.
    virtual Hsys::ErrorStatus subGetClassID(_GUID* id) const;
    virtual std::int16_t ZyrBirthVersion() const;
    virtual std::int16_t ZyrCurrentVersion() const;

    ZyrImpObj* imp() { return ownedImp(); }
    const ZyrImpObj* imp() const { return ownedImp(); }
    // Deletes the held implementation object and takes imp (null leaves none). Needs write.
    void setImp(ZyrImpObj* imp);

    // The implementation object's setToStandard and subSetDatabaseDefaults. Needs write;
    // eNullPointer without an implementation object.
    Hsys::ErrorStatus initializeStandardsAndDefaults(HsDbDatabase* database);

protected:
    HsDbObject* self() override { return this; }
};
