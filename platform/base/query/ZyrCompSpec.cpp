#include "platform/base/query/ZyrCompSpec.h"

#include "platform/base/dict/ZyrDict.h"
#include "platform/base/obj/ZyrClassId.h"
#include "platform/host/db/HsDbObject.h"
#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrCompSpec, HsRxObject, 0, nullptr)

HsRxClass* ZyrCompSpec::worksWith() const {
    return nullptr;
}

void ZyrCompSpec::extendedClasses(HsArray<void*>& /*classes*/) const {}

Hsys::ErrorStatus ZyrCompSpec::propSetLocations(HsDbObject* object, HsArray<HsDbObjectId>& ids,
                                                ZyrRmCStringArray& names) {
    if (object == nullptr)
        return Hsys::eNullPointer;
    return addLocation(object->objectId(), ids, names);
}

Hsys::ErrorStatus ZyrCompSpec::addLocation(const HsDbObjectId& id, HsArray<HsDbObjectId>& ids,
                                           ZyrRmCStringArray& names) {
    if (id.isNull())
        return Hsys::eNullId;
    if (!id.isValid() || id.isErased())
        return Hsys::eWasErased;
    if (ids.contains(id))
        return Hsys::eAlreadyPresent;
    ZyrRmCString name;
    if (ZyrDict::recordName(id, name) != Hsys::eSuccess)
        Zyr::classTypeToDisplayName(id.objectClass(), name);
    ids.append(id);
    names.push_back(name);
    return Hsys::eSuccess;
}
