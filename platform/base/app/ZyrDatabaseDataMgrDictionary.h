// The managers of per-database packets, one for each application that registered a packet class.
#pragma once

#include "platform/host/db/HsDbDatabaseReactor.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <functional>
#include <map>
#include <memory>

class HsDbDatabase;
class HsRxClass;
class ZyrDatabaseData;

// Holds one packet of its class for each database that asked for one. A packet dies with its
// database (or when the database is emptied, as the ids it may hold die then), or with the manager
// when the application unregisters its packet type. The manager watches only the databases that
// have a packet of it.
class ZyrDatabaseDataMgr : private HsDbDatabaseReactor {
public:
    explicit ZyrDatabaseDataMgr(HsRxClass* packetClass);
    ~ZyrDatabaseDataMgr() override;
    ZyrDatabaseDataMgr(const ZyrDatabaseDataMgr&) = delete;
    ZyrDatabaseDataMgr& operator=(const ZyrDatabaseDataMgr&) = delete;

    // The packet of a database: made through the class's create() and init on the first ask. Null
    // for a null database (callers that mean the working database pass it), and when the class
    // makes no packet.
    virtual ZyrDatabaseData* databaseData(HsDbDatabase* database);

    HsRxClass* packetClass() const { return m_packetClass; }
    // Whether the database has its packet yet, without making one.
    bool hasDatabaseData(const HsDbDatabase* database) const;
    int packetCount() const { return static_cast<int>(m_packets.size()); }

private:
    void databaseCleared(HsDbDatabase* database) override;
    void goodbye(HsDbDatabase* database) override;
    void dropPacket(HsDbDatabase* database);

    HsRxClass* m_packetClass;
    std::map<HsDbDatabase*, std::unique_ptr<ZyrDatabaseData>, std::less<>> m_packets;
};

class ZyrDatabaseDataMgrDictionary {
public:
    ZyrDatabaseDataMgrDictionary() = delete;

    // Makes the application's manager for a packet class. eNullPointer for a null or empty name or
    // class; eWrongClass for a class that is not derived from ZyrDatabaseData or has no pseudo
    // constructor; eAlreadyPresent when the name has this class already, eDuplicateName when it
    // has another.
    static Hsys::ErrorStatus registerPacketType(const wchar_t* appName, HsRxClass* packetClass);
    // Deletes the application's manager with every packet it made. eNullPointer for a null name,
    // eNameNotFound for a name without a packet type.
    static Hsys::ErrorStatus unRegisterPacketType(const wchar_t* appName);
    // The application's manager, or null.
    static ZyrDatabaseDataMgr* getMgr(const wchar_t* appName);
};
