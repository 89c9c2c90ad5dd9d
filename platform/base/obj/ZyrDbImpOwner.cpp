#include "platform/base/obj/ZyrDbImpOwner.h"

#include "platform/base/obj/ZyrDbEntity.h"
#include "platform/base/obj/ZyrDbObject.h"
#include "platform/base/obj/ZyrImpObj.h"
#include "platform/base/obj/ZyrParamContainer.h"
#include "platform/base/relgraph/ZyrObjRelGraph.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

ZyrDbImpOwner::~ZyrDbImpOwner() {
    delete m_imp;
}

ZyrDbImpOwner* ZyrDbImpOwner::of(const HsDbObject* object) {
    if (ZyrDbObject* dbObject = ZyrDbObject::cast(object))
        return dbObject;
    if (ZyrDbEntity* entity = ZyrDbEntity::cast(object))
        return entity;
    return nullptr;
}

void ZyrDbImpOwner::recordParameterChanged(int paramId, HsRxClass* paramClass,
                                           ZyrParamChangeFlag::Type flags) {
    m_parameterChanges.emplace_back(paramId, paramClass, nullptr, flags);
}

void ZyrDbImpOwner::recordParameterChanges(const ZyrParamContainer& container) {
    for (int i = 0; i < container.count(); ++i) {
        const ZyrParamInfo* info = container.at(i);
        recordParameterChanged(info->paramId(), info->paramClass(), info->flags());
    }
}

void ZyrDbImpOwner::recordReferencesModified() {
    ZyrObjRelGraph::noteReferencesModified(self());
}

Hsys::ErrorStatus ZyrDbImpOwner::getReferencedObjects(ZyrObjReferenceMap& map) const {
    return m_imp != nullptr ? m_imp->getReferencedObjects(map) : Hsys::eSuccess;
}

void ZyrDbImpOwner::replaceImp(ZyrImpObj* imp) {
    if (imp == m_imp)
        return;
    delete m_imp;
    m_imp = imp;
    if (m_imp != nullptr)
        m_imp->setParent(self());
}

Hsys::ErrorStatus ZyrDbImpOwner::bdfOutVersion(HsDbBdfFiler* filer) const {
    return Zyr::bdfWriteVersion(filer);
}

Hsys::ErrorStatus ZyrDbImpOwner::bdfInVersion(HsDbBdfFiler* filer) {
    return Zyr::bdfReadVersion(filer, m_filedVersion);
}

Hsys::ErrorStatus ZyrDbImpOwner::bdfOutVersionAndImp(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = bdfOutVersion(filer); status != Hsys::eSuccess)
        return status;
    return Zyr::writeObject(filer, m_imp, static_cast<unsigned short>(Zyr::kCurrentVersion));
}

Hsys::ErrorStatus ZyrDbImpOwner::bdfInVersionAndImp(HsDbBdfFiler* filer,
                                                    const HsRxClass* impClass) {
    if (const Hsys::ErrorStatus status = bdfInVersion(filer); status != Hsys::eSuccess)
        return status;
    ZyrImpObj* read = nullptr;
    if (const Hsys::ErrorStatus status = Zyr::readObjectOfClass(
            filer, self(), impClass, read, static_cast<unsigned short>(m_filedVersion));
        status != Hsys::eSuccess)
        return status;
    replaceImp(read);
    return filer->filerStatus();
}

Hsys::ErrorStatus ZyrDbImpOwner::tdfOutImp(HsDbTdfFiler* filer) const {
    return m_imp != nullptr ? m_imp->tdfOutFields(filer) : filer->filerStatus();
}

Hsys::ErrorStatus ZyrDbImpOwner::tdfInImp(HsDbTdfFiler* filer) {
    return m_imp != nullptr ? m_imp->tdfInFields(filer) : filer->filerStatus();
}

Hsys::ErrorStatus ZyrDbImpOwner::auditImp(HsDbAuditInfo* info) {
    return m_imp != nullptr ? m_imp->audit(info) : Hsys::eSuccess;
}

void ZyrDbImpOwner::setImpDatabaseDefaults(HsDbDatabase* database) {
    if (m_imp != nullptr)
        m_imp->subSetDatabaseDefaults(database);
}

Hsys::ErrorStatus ZyrDbImpOwner::copyImpFrom(const ZyrDbImpOwner& other) {
    const ZyrImpObj* source = other.m_imp;
    if (source == nullptr) {
        replaceImp(nullptr);
        return Hsys::eSuccess;
    }
    if (m_imp != nullptr && m_imp->isA() == source->isA())
        return m_imp->copyFrom(source);
    ZyrImpObj* copy = ZyrImpObj::cast(source->clone());
    if (copy == nullptr)
        return Hsys::eBadArgument;
    replaceImp(copy);
    return Hsys::eSuccess;
}
