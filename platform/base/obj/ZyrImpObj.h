// The root of every implementation object: the data half of a public/implementation pair, or an
// object nested in another one (a profile, a tree node, an override).
#pragma once

#include "platform/base/obj/ZyrFiling.h"
#include "platform/base/obj/ZyrParamChangeFlag.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/rx/HsRxObject.h"
#include "platform/host/ut/HsArray.h"

#include <cstdint>

class HsDbAuditInfo;
class HsDbBdfFiler;
class HsDbDatabase;
class HsDbObject;
class HsDbTdfFiler;
class ZyrDesc;
class ZyrEnhancedReferenceAuditInfo;
class ZyrObjReferenceMap;
class ZyrParamContainer;
class ZyrRmCString;
struct ZyrScaleInfo;

// An implementation object has one parent: the public object that owns it (setParent with an
// HsDbObject) or the implementation object it is nested in (setParent with a ZyrImpObj). The
// parent is not owned. dbParent() follows nested parents up to the public object, so that a change
// anywhere in a nest asks write access of, and is recorded on, the one object the database knows.
// An object without a parent belongs to whoever made it and is always writable.
//
// Filing follows one pattern at every level, public or implementation: the base's fields, then the
// level's int16 version word, then its own fields (see ZyrFiling.h). This level files only its
// version word.
class ZyrImpObj : public HsRxObject {
    HSRX_DECLARE_MEMBERS(ZyrImpObj)

public:
    ZyrImpObj();
    ZyrImpObj(const ZyrImpObj&) = delete;
    ZyrImpObj& operator=(const ZyrImpObj&) = delete;

    // The virtual operations, in the order of their slots (the first ones are HsRxObject's).
    ~ZyrImpObj() override;
    // eNullPointer for null, eBadArgument for an object that is no implementation object; this
    // level has no fields to copy.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    virtual std::int16_t ZyrBirthVersion() const;
    virtual std::int16_t ZyrCurrentVersion() const;
    virtual Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer);
    virtual Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const;
    // Text filing adds nothing at this level; a class that refuses text files says so itself.
    virtual Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer);
    virtual Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const;
    // Nothing to check at this level; eNullPointer without an audit.
    virtual Hsys::ErrorStatus audit(HsDbAuditInfo* info);
    // A cycle of nested parents is a programming error and throws HsAssertionViolation.
    virtual void setParent(HsDbObject* parent);
    virtual void setParent(ZyrImpObj* parent);
    // Adds the ids this object refers to. Every class calls its base's first.
    virtual Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const;
    // The text an audit prints for a referenced id that is bad: the class, the handle and why.
    virtual ZyrRmCString enhancedReferenceMessage(const HsDbObjectId& id) const;
    // Adds to badCount the referenced ids (of getReferencedObjects) that have no object or whose
    // object is erased. This level cannot repair a reference, whatever fix says.
    virtual Hsys::ErrorStatus verifyReferences(int& badCount, bool fix);
    // The same, and each bad id goes to info with its enhancedReferenceMessage.
    virtual Hsys::ErrorStatus verifyReferences(ZyrEnhancedReferenceAuditInfo& info);
    // Adds the object's rows to a summary; this level has none.
    virtual void summaryInfo(ZyrDesc* desc) const;
    // Fills what is unset from the database's standard records; nothing at this level.
    virtual Hsys::ErrorStatus subSetDatabaseDefaults(HsDbDatabase* database);
    // Sets the values a new object takes in the database; nothing at this level.
    virtual Hsys::ErrorStatus setToStandard(HsDbDatabase* database);
    // setToStandard, then subSetDatabaseDefaults: a new object made ready for the database. The
    // first failure.
    virtual Hsys::ErrorStatus initializeStandardsAndDefaults(HsDbDatabase* database);
    // Nothing to scale at this level.
    virtual Hsys::ErrorStatus scaleBy(const ZyrScaleInfo& info);
    // The database of dbParent(), or null.
    virtual HsDbDatabase* database() const;
    // Objects of this system carry no materials: none are added, and setting any does not apply.
    virtual Hsys::ErrorStatus getMaterialComponents(HsArray<HsDbObjectId>& materialIds) const;
    virtual Hsys::ErrorStatus setMaterialComponents(const HsArray<HsDbObjectId>& materialIds);
    // Called on this object and on each nested parent above it, in that order, when a change is
    // recorded below or at it; a level may add an entry that states the change in its own terms.
    // Nothing at this level.
    virtual Hsys::ErrorStatus parameterChanged(ZyrParamContainer& container);

    // The public object at the top of the nest, or null.
    HsDbObject* dbParent() const;
    // The implementation object this one is nested in, or null.
    ZyrImpObj* impParent() const { return m_impParent; }

    // Write access on dbParent() (with autoUndo and recordModified passed on); nothing without one.
    // Throws HsAssertionViolation when the public object is not open for write.
    void assertParentWriteEnabled(bool autoUndo = true, bool recordModified = true);
    // Read access on dbParent(); nothing without one.
    void assertParentReadEnabled() const;
    // Tells the relationship graph of dbParent()'s database that the public object's references
    // changed. Nothing for an object in no database.
    void recordParentReferencesModified();
    // Puts ZyrParamInfo(paramId, paramClass, object, flags) in a new container, runs
    // parameterChanged from this object up through its nested parents, and leaves every entry in
    // the notes of the public object at the top (ZyrDbImpOwner::parameterChanges).
    void recordParameterChanged(int paramId, HsRxClass* paramClass, ZyrParamChangeFlag::Type flags,
                                HsRxObject* object);

    // The version word this object's own level last read; the current version for an object
    // that was never read. Readers of old layouts test it.
    std::int16_t filedVersion() const { return m_filedVersion; }

protected:
    // The one way a level files its version word: bdfOutVersion writes the current version;
    // bdfInVersion reads it into filedVersion() and gates it (ZyrFiling.h, Zyr::bdfReadVersion).
    Hsys::ErrorStatus bdfOutVersion(HsDbBdfFiler* filer) const;
    Hsys::ErrorStatus bdfInVersion(HsDbBdfFiler* filer);

private:
    HsDbObject* m_dbParent = nullptr;
    ZyrImpObj* m_impParent = nullptr;
    std::int16_t m_filedVersion = Zyr::kCurrentVersion;
};
