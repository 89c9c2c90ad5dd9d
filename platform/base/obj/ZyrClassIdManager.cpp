#include "platform/base/obj/ZyrClassIdManager.h"

namespace {

struct Table {
    std::map<const HsRxClass*, unsigned short> byClass;
    std::map<unsigned short, HsRxClass*> byId;
};

Table& table() {
    static Table ids;
    return ids;
}

} // namespace

bool ZyrClassIdManager::append(HsRxClass* cls, unsigned short classId) {
    if (cls == nullptr || table().byClass.count(cls) != 0 || table().byId.count(classId) != 0)
        return false;
    table().byClass[cls] = classId;
    table().byId[classId] = cls;
    return true;
}

bool ZyrClassIdManager::remove(HsRxClass* cls) {
    auto found = table().byClass.find(cls);
    if (found == table().byClass.end())
        return false;
    table().byId.erase(found->second);
    table().byClass.erase(found);
    return true;
}

bool ZyrClassIdManager::classId(const HsRxClass* cls, unsigned short& classId) {
    auto found = table().byClass.find(cls);
    if (found == table().byClass.end())
        return false;
    classId = found->second;
    return true;
}

HsRxClass* ZyrClassIdManager::classFor(unsigned short classId) {
    auto found = table().byId.find(classId);
    return found != table().byId.end() ? found->second : nullptr;
}
