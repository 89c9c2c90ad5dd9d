#include "platform/base/app/ZyrDatabaseDataMgrDictionary.h"

#include "platform/base/app/ZyrDatabaseData.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/rx/HsRxClass.h"

#include <string>

namespace {

std::map<std::wstring, std::unique_ptr<ZyrDatabaseDataMgr>>& managers() {
    static std::map<std::wstring, std::unique_ptr<ZyrDatabaseDataMgr>> byAppName;
    return byAppName;
}

bool isName(const wchar_t* name) {
    return name != nullptr && *name != L'\0';
}

} // namespace

ZyrDatabaseDataMgr::ZyrDatabaseDataMgr(HsRxClass* packetClass) : m_packetClass(packetClass) {}

ZyrDatabaseDataMgr::~ZyrDatabaseDataMgr() {
    for (const auto& [database, packet] : m_packets)
        database->removeReactor(this);
}

ZyrDatabaseData* ZyrDatabaseDataMgr::databaseData(HsDbDatabase* database) {
    if (database == nullptr)
        return nullptr;
    if (const auto found = m_packets.find(database); found != m_packets.end())
        return found->second.get();
    std::unique_ptr<HsRxObject> created(m_packetClass->create());
    if (ZyrDatabaseData::cast(created.get()) == nullptr)
        return nullptr;
    auto* packet = static_cast<ZyrDatabaseData*>(created.release());
    m_packets.emplace(database, packet);
    database->addReactor(this);
    packet->init(database);
    return packet;
}

bool ZyrDatabaseDataMgr::hasDatabaseData(const HsDbDatabase* database) const {
    return m_packets.contains(database);
}

void ZyrDatabaseDataMgr::dropPacket(HsDbDatabase* database) {
    database->removeReactor(this);
    m_packets.erase(database);
}

void ZyrDatabaseDataMgr::databaseCleared(HsDbDatabase* database) {
    dropPacket(database);
}

void ZyrDatabaseDataMgr::goodbye(HsDbDatabase* database) {
    dropPacket(database);
}

Hsys::ErrorStatus ZyrDatabaseDataMgrDictionary::registerPacketType(const wchar_t* appName,
                                                                   HsRxClass* packetClass) {
    if (!isName(appName) || packetClass == nullptr)
        return Hsys::eNullPointer;
    if (!packetClass->isDerivedFrom(ZyrDatabaseData::desc()) ||
        packetClass->pseudoConstructor() == nullptr)
        return Hsys::eWrongClass;
    if (const ZyrDatabaseDataMgr* present = getMgr(appName); present != nullptr)
        return present->packetClass() == packetClass ? Hsys::eAlreadyPresent : Hsys::eDuplicateName;
    managers().emplace(appName, std::make_unique<ZyrDatabaseDataMgr>(packetClass));
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrDatabaseDataMgrDictionary::unRegisterPacketType(const wchar_t* appName) {
    if (appName == nullptr)
        return Hsys::eNullPointer;
    return managers().erase(appName) == 1 ? Hsys::eSuccess : Hsys::eNameNotFound;
}

ZyrDatabaseDataMgr* ZyrDatabaseDataMgrDictionary::getMgr(const wchar_t* appName) {
    if (appName == nullptr)
        return nullptr;
    const auto found = managers().find(appName);
    return found != managers().end() ? found->second.get() : nullptr;
}
