// What the two public bases share: the implementation object they own and drive, their filed
// version word and the notes of reported parameter changes.
#pragma once

#include "platform/base/obj/ZyrFiling.h"
#include "platform/base/obj/ZyrParamInfo.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <cstdint>
#include <vector>

class HsDbAuditInfo;
class HsDbBdfFiler;
class HsDbDatabase;
class HsDbObject;
class HsDbTdfFiler;
class HsRxClass;
class ZyrImpObj;
class ZyrObjReferenceMap;
class ZyrParamContainer;

// ZyrDbObject and ZyrDbEntity derive from different host classes, so what they have in common
// lives here, written once; each of them wires it into its host base's virtual operations.
class ZyrDbImpOwner {
public:
    ZyrDbImpOwner(const ZyrDbImpOwner&) = delete;
    ZyrDbImpOwner& operator=(const ZyrDbImpOwner&) = delete;

    // The owner behind a public object of either base, or null for any other object.
    static ZyrDbImpOwner* of(const HsDbObject* object);

    // The version word the public object's own level last read; the current one until a read.
    std::int16_t filedVersion() const { return m_filedVersion; }

    // Notes that a parameter changed, for whoever watches the object (display caches, later
    // layers); the notes are not filed and not copied. Callers have asserted write.
    void recordParameterChanged(int paramId, HsRxClass* paramClass,
                                ZyrParamChangeFlag::Type flags = ZyrParamChangeFlag::kAll);
    // Notes every entry of a container, in order; the entries' objects are not kept.
    void recordParameterChanges(const ZyrParamContainer& container);
    const std::vector<ZyrParamInfo>& parameterChanges() const { return m_parameterChanges; }
    void clearParameterChanges() { m_parameterChanges.clear(); }

    // Tells the relationship graph of the object's database that its references changed.
    void recordReferencesModified();
    // The implementation object's references, and those a derived base adds (overrides).
    virtual Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const;

protected:
    ZyrDbImpOwner() = default;
    virtual ~ZyrDbImpOwner();

    // The public object itself, as the host sees it.
    virtual HsDbObject* self() = 0;
    const HsDbObject* self() const { return const_cast<ZyrDbImpOwner*>(this)->self(); }

    ZyrImpObj* ownedImp() const { return m_imp; }
    // Deletes the held object and takes imp, making the public object its parent.
    void replaceImp(ZyrImpObj* imp);

    // The one way a public level files its version word (Zyr::bdfWriteVersion, and
    // Zyr::bdfReadVersion into filedVersion()).
    Hsys::ErrorStatus bdfOutVersion(HsDbBdfFiler* filer) const;
    Hsys::ErrorStatus bdfInVersion(HsDbBdfFiler* filer);
    // The public base's version word and its implementation object, nested with its class. The
    // reader refuses an object that is not of impClass (eWrongClass, the filer failed) and keeps
    // the object it held on any failure.
    Hsys::ErrorStatus bdfOutVersionAndImp(HsDbBdfFiler* filer) const;
    Hsys::ErrorStatus bdfInVersionAndImp(HsDbBdfFiler* filer, const HsRxClass* impClass);
    // The implementation object's text fields, when there is one.
    Hsys::ErrorStatus tdfOutImp(HsDbTdfFiler* filer) const;
    Hsys::ErrorStatus tdfInImp(HsDbTdfFiler* filer);
    // The implementation object's audit, when there is one.
    Hsys::ErrorStatus auditImp(HsDbAuditInfo* info);
    void setImpDatabaseDefaults(HsDbDatabase* database);
    // The other owner's implementation object into this one: copied into the held one when both
    // are of one class, else cloned. eBadArgument when the other's cannot be cloned.
    Hsys::ErrorStatus copyImpFrom(const ZyrDbImpOwner& other);

private:
    ZyrImpObj* m_imp = nullptr;
    std::int16_t m_filedVersion = Zyr::kCurrentVersion;
    std::vector<ZyrParamInfo> m_parameterChanges;
};
