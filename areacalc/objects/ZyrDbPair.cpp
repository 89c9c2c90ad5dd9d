#include "areacalc/objects/ZyrDbPair.h"

#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbProxyObject.h"
#include "platform/host/db/HsDbTransactionManager.h"
#include "platform/host/rx/HsRxClass.h"

namespace Zyr {

Hsys::ErrorStatus checkOpenable(const HsDbObjectId& id, const HsRxClass* cls) {
    if (id.isNull())
        return Hsys::eNullId;
    const HsRxClass* objectClass = id.objectClass();
    const bool openable =
        objectClass != nullptr &&
        (objectClass->isDerivedFrom(cls) || objectClass->isDerivedFrom(HsDbProxyObject::desc()));
    return openable ? Hsys::eSuccess : Hsys::eWrongClass;
}

Hsys::ErrorStatus openInTransaction(HsDbObject*& object, const HsDbObjectId& id,
                                    HsDb::OpenMode mode, bool openErased) {
    object = nullptr;
    HsDbDatabase* database = id.database();
    HsDbTransactionManager* manager =
        database != nullptr ? database->transactionManager() : nullptr;
    if (manager == nullptr)
        return Hsys::eBadArgument;
    return manager->getObject(object, id, mode, openErased);
}

} // namespace Zyr
