#include "platform/host/db/HsDbObject.h"

#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbIdEntry.h"
#include "platform/host/db/HsDbTransactionManager.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsAssertionViolation.h"
#include "platform/host/ut/HsutFormat.h"
#include "platform/host/ut/HsutUtf8.h"

HSRX_DEFINE_MEMBERS(HsDbObject, HsRxObject, 0, nullptr)

namespace {

constexpr int kOwnerGroupCode = 330;

Hsys::ErrorStatus firstFailure(Hsys::ErrorStatus first, Hsys::ErrorStatus second) {
    return first != Hsys::eSuccess ? first : second;
}

} // namespace

HsDbObject::~HsDbObject() {
    if (m_entry != nullptr)
        hsrx_abort(L"%s was deleted while its database owns it", describe().c_str());
}

Hsys::ErrorStatus HsDbObject::subErase(bool /*erasing*/) {
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbObject::subHandOverTo(HsDbObject* /*newObject*/) {
    return Hsys::eSuccess;
}

void HsDbObject::subSetDatabaseDefaults(HsDbDatabase* /*database*/) {}

Hsys::ErrorStatus HsDbObject::audit(HsDbAuditInfo* info) {
    if (info == nullptr)
        return Hsys::eNullPointer;
    if (m_ownerId.isNull() || m_ownerId.isValid())
        return Hsys::eSuccess;
    const std::wstring owner =
        hsutFormat(L"owner %llu", static_cast<unsigned long long>(m_ownerId.handle()));
    info->printError(this, owner.c_str(), L"has no object",
                     info->fixErrors() ? L"cleared" : L"kept");
    info->errorsFound(1);
    if (info->fixErrors()) {
        assertWriteEnabled();
        m_ownerId.setNull();
        info->errorsFixed(1);
    }
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbObject::bdfInFields(HsDbBdfFiler* filer) {
    HsDbObjectId owner;
    if (filer->readSoftPointerId(owner) == Hsys::eSuccess)
        m_ownerId = owner;
    return filer->filerStatus();
}

Hsys::ErrorStatus HsDbObject::bdfOutFields(HsDbBdfFiler* filer) const {
    filer->writeSoftPointerId(m_ownerId);
    return filer->filerStatus();
}

Hsys::ErrorStatus HsDbObject::tdfInFields(HsDbTdfFiler* filer) {
    return filer->readObjectIdItem(kOwnerGroupCode, m_ownerId);
}

Hsys::ErrorStatus HsDbObject::tdfOutFields(HsDbTdfFiler* filer) const {
    filer->writeItem(HsDbTdfItem(kOwnerGroupCode, m_ownerId));
    return filer->filerStatus();
}

HsDbObjectId HsDbObject::objectId() const {
    return HsDbObjectId(m_entry);
}

void HsDbObject::setOwnerId(const HsDbObjectId& ownerId) {
    assertWriteEnabled();
    m_ownerId = ownerId;
}

HsDbDatabase* HsDbObject::database() const {
    return m_entry != nullptr ? m_entry->database : nullptr;
}

Hsys::ErrorStatus HsDbObject::openFor(HsDb::OpenMode mode) {
    if (m_notify)
        return Hsys::eWasOpenForNotify;
    if (m_writer)
        return Hsys::eWasOpenForWrite;
    switch (mode) {
    case HsDb::kForRead:
        ++m_readers;
        return Hsys::eSuccess;
    case HsDb::kForWrite:
        if (m_readers > 0)
            return Hsys::eWasOpenForRead;
        m_writer = true;
        return Hsys::eSuccess;
    case HsDb::kForNotify:
        if (m_readers > 0)
            return Hsys::eWasOpenForRead;
        m_notify = true;
        return Hsys::eSuccess;
    }
    return Hsys::eBadArgument;
}

Hsys::ErrorStatus HsDbObject::close() {
    if (m_entry == nullptr)
        return Hsys::eNotInDatabase;
    if (m_writer)
        m_writer = false;
    else if (m_notify)
        m_notify = false;
    else if (m_readers > 0)
        --m_readers;
    else
        return Hsys::eNotOpenForRead;
    if (!m_writer && !m_notify && m_readers == 0)
        m_modified = false;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbObject::upgradeOpen() {
    if (m_entry == nullptr || m_writer)
        return Hsys::eAlreadyWritable;
    if (m_notify)
        return Hsys::eWasOpenForNotify;
    if (m_readers == 0)
        return Hsys::eNotOpenForRead;
    if (m_readers > 1)
        return Hsys::eWasOpenForRead;
    m_readers = 0;
    m_writer = true;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbObject::downgradeOpen() {
    if (m_entry == nullptr || !m_writer)
        return Hsys::eNotOpenForWrite;
    m_writer = false;
    m_readers = 1;
    return Hsys::eSuccess;
}

bool HsDbObject::isReadEnabled() const {
    return m_entry == nullptr || m_readers > 0 || m_writer || m_notify;
}

bool HsDbObject::isWriteEnabled() const {
    return m_entry == nullptr || m_writer;
}

bool HsDbObject::isNotifyEnabled() const {
    return m_entry == nullptr || m_notify;
}

void HsDbObject::assertReadEnabled() const {
    if (!isReadEnabled())
        failAssertion("read");
}

void HsDbObject::assertWriteEnabled(bool autoUndo, bool recordModified) {
    if (!isWriteEnabled())
        failAssertion("write");
    if (autoUndo && m_entry != nullptr && !m_undoing)
        if (HsDbTransactionManager* transactions = m_entry->database->transactionManager())
            transactions->recordUndo(this);
    if (recordModified)
        m_modified = true;
}

void HsDbObject::assertNotifyEnabled() const {
    if (!isNotifyEnabled())
        failAssertion("notify");
}

void HsDbObject::failAssertion(const char* expected) const {
    throw HsAssertionViolation(hsutToUtf8(describe()) + " is not open for " + expected);
}

Hsys::ErrorStatus HsDbObject::erase(bool erasing) {
    if (m_entry == nullptr)
        return Hsys::eNotInDatabase;
    if (m_entry->erased == erasing)
        return Hsys::eSuccess;
    if (!isWriteEnabled())
        return Hsys::eNotOpenForWrite;
    if (const Hsys::ErrorStatus refused = subErase(erasing); refused != Hsys::eSuccess)
        return refused;
    assertWriteEnabled();
    m_entry->erased = erasing;
    return Hsys::eSuccess;
}

bool HsDbObject::isErased() const {
    return m_entry != nullptr && m_entry->erased;
}

Hsys::ErrorStatus HsDbObject::handOverTo(HsDbObject* newObject) {
    if (newObject == nullptr)
        return Hsys::eNullPointer;
    if (m_entry == nullptr)
        return Hsys::eNotInDatabase;
    if (newObject == this || newObject->m_entry != nullptr)
        return Hsys::eAlreadyPresent;
    if (!m_writer)
        return Hsys::eNotOpenForWrite;
    const HsDbTransactionManager* transactions = m_entry->database->transactionManager();
    if (transactions != nullptr && transactions->numActiveTransactions() > 0)
        return Hsys::eDoesNotApply;
    if (const Hsys::ErrorStatus refused = subHandOverTo(newObject); refused != Hsys::eSuccess)
        return refused;
    newObject->m_entry = m_entry;
    newObject->m_ownerId = m_ownerId;
    newObject->m_writer = true;
    newObject->m_modified = true;
    m_entry->object = newObject;
    HsDbDatabase* database = m_entry->database;
    m_entry = nullptr;
    m_writer = false;
    m_modified = false;
    database->notifyAppended(newObject);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbObject::bdfIn(HsDbBdfFiler* filer) {
    if (filer == nullptr)
        return Hsys::eNullPointer;
    assertWriteEnabled();
    return firstFailure(bdfInFields(filer), filer->filerStatus());
}

Hsys::ErrorStatus HsDbObject::bdfOut(HsDbBdfFiler* filer) const {
    if (filer == nullptr)
        return Hsys::eNullPointer;
    assertReadEnabled();
    return firstFailure(bdfOutFields(filer), filer->filerStatus());
}

Hsys::ErrorStatus HsDbObject::tdfIn(HsDbTdfFiler* filer) {
    if (filer == nullptr)
        return Hsys::eNullPointer;
    assertWriteEnabled();
    return firstFailure(tdfInFields(filer), filer->filerStatus());
}

Hsys::ErrorStatus HsDbObject::tdfOut(HsDbTdfFiler* filer) const {
    if (filer == nullptr)
        return Hsys::eNullPointer;
    assertReadEnabled();
    return firstFailure(tdfOutFields(filer), filer->filerStatus());
}

std::wstring HsDbObject::describe() const {
    return hsutFormat(L"%s(%llu)", isA()->name(),
                      static_cast<unsigned long long>(objectId().handle()));
}

Hsys::ErrorStatus hsdbOpenObject(HsDbObject*& object, HsDbObjectId id, HsDb::OpenMode mode,
                                 bool openErased, const HsRxClass* objectClass) {
    object = nullptr;
    if (id.isNull())
        return Hsys::eNullId;
    HsDbObject* target = id.entry()->object;
    if (target == nullptr)
        return Hsys::eKeyNotFound;
    if (id.isErased() && !openErased)
        return Hsys::eWasErased;
    if (objectClass != nullptr && !target->isKindOf(objectClass))
        return Hsys::eWrongClass;
    if (const Hsys::ErrorStatus conflict = target->openFor(mode); conflict != Hsys::eSuccess)
        return conflict;
    object = target;
    return Hsys::eSuccess;
}
